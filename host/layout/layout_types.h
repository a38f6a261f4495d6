#pragma once

#include <string>
#include <vector>

#include "host/shaping/glyph_types.h"

// The plain values that go into and come out of the text layout. Nothing here knows a database: an
// entity copies its own values in, and keeps the result until one of them changes.
//
// All lengths are drawing units. The frame of a result has its origin at the attachment point
// (MTEXT) or at the insertion point (a single line), x along the text's direction and y up. A text
// height is the height of capitals. Angles are radians, save where a comment says degrees.
namespace tzhost {

// What a text style record says about its letters. An empty typeface means the font file counts.
struct LayoutStyle {
    std::wstring fontFile;
    std::wstring bigFontFile;
    std::wstring typeface;
    bool bold = false;
    bool italic = false;
    int charset = 0;
    int pitchAndFamily = 0;
    double widthFactor = 1.0;
    double oblique = 0.0;
    bool vertical = false;
    bool backward = false;
    bool upsideDown = false;
};

// Columns as the entity holds them. `heights` counts for dynamic
// columns without automatic height, a height of 0 or below standing for no limit.
struct LayoutColumns {
    // The types.
    static constexpr int kNone = 0;
    static constexpr int kStatic = 1;
    static constexpr int kDynamic = 2;

    int type = kNone;
    bool autoHeight = false;
    int count = 0;
    double width = 0.0;
    double gutter = 0.0;
    std::vector<double> heights;
};

// Everything that decides how an MTEXT looks. A width of 0 or below does not wrap.
struct MTextLayoutInput {
    std::wstring contents;
    double width = 0.0;
    double height = 0.0;
    double textHeight = 0.2;
    LayoutStyle style;
    int lineSpacingStyle = 1;  // 1 at least, 2 exactly
    double lineSpacingFactor = 1.0;
    LayoutColumns columns;
    int attachment = 1;           // 1 to 9, top left to bottom right, row by row
    int stackScalePercent = 100;  // height of stacked parts against the height in force
    TextColor color;
};

// A single line of TEXT, placed at its left end of the baseline.
struct LineLayoutInput {
    std::wstring text;
    double textHeight = 0.2;
    LayoutStyle style;
    TextColor color;
    double tracking = 1.0;  // factor on advances
};

struct LayoutBox {
    double left = 0.0;
    double bottom = 0.0;
    double right = 0.0;
    double top = 0.0;

    [[nodiscard]] double width() const { return right - left; }
    [[nodiscard]] double height() const { return top - bottom; }
};

enum class RuleKind { underline, overline, stackBar, stackSlash };

// A straight line that belongs to the text; it has no width of its own.
struct TextRule {
    RuleKind kind = RuleKind::underline;
    LayoutPoint from;
    LayoutPoint to;
    TextColor color;
};

// One line of an MTEXT: where it starts, how far it runs (blanks where it wrapped left out), and
// the column that holds it, counted from 0.
struct LayoutLine {
    int column = 0;
    double x = 0.0;
    double baseline = 0.0;
    double advance = 0.0;
};

// A laid out MTEXT. `width` and `height` are its measured size: from the top of the first line's
// capitals to the last baseline (or to the foot of a stack below it), and as wide as the longest
// line, or as the columns together. `box` is that size placed in the frame.
struct MTextLayout {
    double width = 0.0;
    double height = 0.0;
    LayoutBox box;
    std::vector<LayoutLine> lines;
    std::vector<GlyphRun> runs;
    std::vector<TextRule> rules;
};

// A laid out single line. `box` runs from the insertion point to the end of the advance and from
// the baseline to the top of capitals, mirrored with the text.
struct LineLayout {
    LayoutBox box;
    std::vector<GlyphRun> runs;
};

}  // namespace tzhost
