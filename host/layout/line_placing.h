#pragma once

#include "host/layout/text_line.h"

// Places the lines of a broken text: columns, alignment, attachment, and then the drawing of each
// line.
namespace tzhost {

// Lines along the text's direction, one under the other.
[[nodiscard]] MTextLayout placeAlong(MTextLayoutInput const& input, BrokenText const& broken);

// Lines of upright letters from top to bottom, the first at the right. Columns do not count, and
// the wrap width is a height.
[[nodiscard]] MTextLayout placeDown(MTextLayoutInput const& input, BrokenText const& broken);

// Where lines stand in their frame, whose width is the wrap width or that of the longest line.
struct LineFrame {
    double share = 0.0;  // the part of the room left by a line that lies before it
    double width = 0.0;

    [[nodiscard]] double offset(SegmentLine const& line) const;
    // How far the lines need the frame, kept even about its middle or its edge.
    [[nodiscard]] double measure(std::vector<LaidLine> const& lines) const;
};
[[nodiscard]] LineFrame frameOf(BrokenText const& broken, double share);

}  // namespace tzhost
