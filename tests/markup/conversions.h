#pragma once

// Both converters over one session, as an editor runs them, and their results in short forms.

#include <string>

#include "module/markup/session/conversion_session.h"

namespace markuptest {

// The text style's size: 0.2 units, which the document has as 280 twips, 28 half-points.
inline constexpr double kSize = 0.2;
inline constexpr int kTwips = 280;

// Puts the suite's own font map in the place of the shipped one and empties the tables.
class OwnFontMap {
public:
    OwnFontMap();
    ~OwnFontMap();
    OwnFontMap(OwnFontMap const&) = delete;
    OwnFontMap& operator=(OwnFontMap const&) = delete;

private:
    std::string before_;
};

// How the tests' texts start: in "Liberation Sans".
[[nodiscard]] TextStart startOfTests();

// One session over the font map that is in force.
class Conversions {
public:
    CMTextFontMapDatabase& fonts() { return *session_.tables().fonts; }
    CScaleCorrection& fontScale() { return *session_.tables().fontScale; }
    CScaleCorrection& marginScale() { return *session_.tables().marginScale; }

    // The whole document.
    [[nodiscard]] CStdStrW toRtf(std::wstring const& markup) { return session_.toRtf(markup).rtf; }
    // The whole markup.
    [[nodiscard]] CStdStrW toMtext(std::wstring const& rtf) {
        return session_.toMarkup(rtf).markup;
    }
    // To rich text and back, with the whole-text values carried over as an editor does.
    [[nodiscard]] CStdStrW roundTrip(std::wstring const& markup);
    // What the last round trip passed over.
    [[nodiscard]] RtfLosses const& losses() const { return losses_; }

private:
    RtfLosses losses_;
    ConversionSession session_{startOfTests()};
};

// Conversions over the suite's own font map, which goes when they do.
class Session : private OwnFontMap, public Conversions {};

// A session with one conversion in it, which is not set up yet.
struct RtfWriter : Session {
    CMTextToRichTextContext context{&fonts(), &fontScale(), &marginScale()};
};
struct MtextWriter : Session {
    CRichTextToMTextContext context{&fonts(), &fontScale(), &marginScale()};
};

// A context set up as a session does.
void setUp(CMTextToRichTextContext& context);
void setUp(CRichTextToMTextContext& context);

// What stands between the head of a document, "\deftab0 " included, and the last "\par }".
[[nodiscard]] std::wstring bodyOf(std::wstring const& document);

// A text as a failed row prints it.
[[nodiscard]] std::string shown(std::wstring const& text);

// Names a test by its row.
inline constexpr auto kRowName = [](auto const& row) { return row.param.name; };

}  // namespace markuptest
