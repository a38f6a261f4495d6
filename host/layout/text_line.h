#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

#include "host/layout/layout_types.h"
#include "host/layout/markup_reader.h"

// The parts that a line of MTEXT is made of while it is being laid out, and their making from a
// stretch of markup without a line end. Positions within a line count from its own start and from
// its baseline.
namespace tzhost {

// What holds for the whole text: factors on advances, the oblique angle in radians, the percentage
// of stacked parts, the distance of tab stops where a paragraph sets none.
struct WholeText {
    double widthFactor = 1.0;
    double tracking = 1.0;
    double oblique = 0.0;
    double stackScale = 1.0;
    double tabDistance = 0.0;
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

// One character of a segment; a stack takes the place of one.
struct SegmentCell {
    double advance = 0.0;
    std::size_t format = 0;
    std::size_t stack = 0;  // counts from 1, 0 is none
    bool mayBreakBefore = false;
    bool isBlank = false;
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

}  // namespace tzhost
