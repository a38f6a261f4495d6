#pragma once

#include <string>

#include "module/markup/write_markup/rtf_to_mtext.h"
#include "module/markup/write_rtf/mtext_to_rtf.h"
#include "tz/mte/font_map_database.h"
#include "tz/mte/scale_correction.h"
#include "tz/mte/stack_alignment.h"
#include "tz/text/charset.h"
#include "tz/text/std_str.h"

// The one place where conversions are set up, in the order that the converters need. An editing
// session converts there and back several times over the same tables:
//
//   ConversionTables const tables{&fonts, &fontScale, &marginScale};
//   TextStart start;
//   start.font.file = L"txt.shx";
//   tables.setScales(start.size, start.twips);
//   WrittenRtf const document = toRtf(tables, start, L"{\\LA}\\P");
//   WrittenMarkup const text = toMarkup(tables, start, document.found.wholeText, 0, document.rtf);

// What all conversions of a session share and none owns. The scales grow with each conversion, so
// that a size that comes back is the size it came from.
struct ConversionTables {
    CMTextFontMapDatabase* fonts;
    CScaleCorrection* fontScale;
    CScaleCorrection* marginScale;

    // The same length in both measures, for both scales.
    void setScales(double units, int twips) const;
};

// The font that a text starts in: a face, or a file when the face is empty.
struct StartFont {
    CStdStrW face;
    bool bold = false;
    bool italic = false;
    Charset charset = kAnsiCharset;
    int pitchAndFamily = 0;
    CStdStrW file;
};

// A colour of ByLayer or ByBlock that was not set.
inline constexpr unsigned int kUnsetColor = 0xFFFFFFFF;

// The look that a text starts with; colours are 0x00BBGGRR. `size` is in drawing units and may
// differ between the two ways of a session; the scales have their own.
struct TextStart {
    StartFont font;
    double size = 0.2;
    int twips = 280;
    unsigned int color = 0;
    unsigned int byLayer = kUnsetColor;
    unsigned int byBlock = kUnsetColor;
};

// Values of a whole text. Rich text cannot hold them, so they are carried beside it.
struct WholeText {
    double tracking = 1.0;
    double charWidth = 1.0;
    double oblique = 0.0;
    VerticalAlignment baseAlignment = kAlignBottom;
};

// What was found in a markup; sizes in half-points.
struct MarkupFindings {
    WholeText wholeText;
    unsigned int incidents = 0;  // bits of ConversionIncident
    IncidentCounts incidentCounts;
    bool stacksSeen = false;
    int minFontSize = 0;
    int maxFontSize = 0;
    int initialFontSize = 0;
    int currentFontSize = 0;
};

struct WrittenRtf {
    CStdStrW rtf;
    MarkupFindings found;
};

struct WrittenMarkup {
    CStdStrW markup;
    bool stacksSeen = false;
    RtfLosses losses;
};

// `rgb`, with its lowest bit flipped when it equals `other`. For the colours of ByLayer and
// ByBlock: the converters tell ByLayer from ByBlock by colour, so the two must differ.
[[nodiscard]] unsigned int colorBeside(unsigned int rgb, unsigned int other);

// A context ready to parse.
void setUp(CMTextToRichTextContext& context, TextStart const& start);
void setUp(CRichTextToMTextContext& context, TextStart const& start, WholeText const& values);

[[nodiscard]] WrittenRtf
toRtf(ConversionTables const& tables, TextStart const& start, std::wstring const& markup);
// `options`: bits of the context's options.
[[nodiscard]] WrittenMarkup toMarkup(ConversionTables const& tables,
                                     TextStart const& start,
                                     WholeText const& values,
                                     unsigned int options,
                                     std::wstring const& rtf);

// A session with tables of its own; its scales begin empty.
class ConversionSession {
public:
    explicit ConversionSession(TextStart start);

    [[nodiscard]] TextStart const& start() const { return start_; }
    [[nodiscard]] ConversionTables tables() { return {&fonts_, &fontScale_, &marginScale_}; }
    [[nodiscard]] WrittenRtf toRtf(std::wstring const& markup);
    [[nodiscard]] WrittenMarkup
    toMarkup(std::wstring const& rtf, WholeText const& values = {}, unsigned int options = 0);

private:
    TextStart start_;
    CMTextFontMapDatabase fonts_{0};
    CScaleCorrection fontScale_{1};
    CScaleCorrection marginScale_{0};
};
