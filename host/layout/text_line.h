#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "host/layout/layout_types.h"
#include "host/layout/markup_reader.h"

// The parts that a line of MTEXT is made of while it is being laid out, and their making from a
// stretch of markup without a line end. Positions within a line count from its own start and from
// its baseline.
namespace tzhost {

// Whether lines run along the text's direction, or down from the top, later lines to the left.
enum class TextFlow { along, down };

// What holds for the whole text: factors on advances, the oblique angle in radians, the percentage
// of stacked parts, the distance of tab stops where a paragraph sets none.
struct WholeText {
    double widthFactor = 1.0;
    double tracking = 1.0;
    double oblique = 0.0;
    double stackScale = 1.0;
    double tabDistance = 0.0;
    TextFlow flow = TextFlow::along;
};

// A look ready to draw with.
struct LineFormat {
    LayoutFace face;
    double height = 0.0;
    TextColor color;
    bool underline = false;
    bool overline = false;
};

// A stack laid out against its own left end; `top` and `bottom` count from the baseline.
struct LaidStack {
    double advance = 0.0;
    double top = 0.0;
    double bottom = 0.0;
    std::vector<GlyphRun> runs;
    std::vector<TextRule> rules;
};

// One character of a segment; a stack takes the place of one. `advance` is counted in the direction
// of the flow, `width` always across the page; the one of a letter stands at its first character.
struct SegmentCell {
    double advance = 0.0;
    double width = 0.0;
    std::size_t format = 0;
    std::size_t stack = 0;  // counts from 1, 0 is none
    bool mayBreakBefore = false;
    bool isBlank = false;
    bool opensLetter = true;
};

// A stretch between two line ends, shaped. `endFormat` is the look in force at its end, which gives
// an empty line its height.
struct Segment {
    std::wstring text;
    std::vector<SegmentCell> cells;
    std::vector<std::size_t> itemEnds;
    std::vector<int> itemLevels;
    std::vector<LaidStack> stacks;
    std::size_t endFormat = 0;
    bool opensParagraph = false;
    std::size_t paragraph = 0;
};

// A part of a line in its visual place.
struct LineFragment {
    std::size_t start = 0;
    std::size_t end = 0;
    int level = 0;
    double x = 0.0;
    double advance = 0.0;
};

// A line cut from a segment: its characters from `start` to `end`, blanks at a soft break left out.
struct SegmentLine {
    std::size_t start = 0;
    std::size_t end = 0;
    double indent = 0.0;
    double advance = 0.0;
    std::vector<LineFragment> fragments;  // from left to right
};

// What the placing of a line needs: the largest text height on it, how far it reaches above and
// below its baseline.
struct LineMetrics {
    double height = 0.0;
    double ascent = 0.0;
    double depth = 0.0;
};

// A line and the segment it was cut from.
struct LaidLine {
    std::size_t segment = 0;
    SegmentLine line;
};

// A text that was broken into lines and is still to be placed. A wrap width of 0 or below has left
// paragraphs unbroken.
struct BrokenText {
    WholeText whole;
    double wrapWidth = 0.0;
    std::vector<LineFormat> formats;
    std::vector<Segment> segments;
    std::vector<LaidLine> lines;

    [[nodiscard]] Segment const& segmentOf(LaidLine const& line) const {
        return segments[line.segment];
    }
};

}  // namespace tzhost
