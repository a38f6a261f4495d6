#pragma once

#include <vector>

#include "host/layout/text_line.h"

// Cuts a shaped segment into lines that fit a width, and orders each line as it is seen.
namespace tzhost {

// The lines of `segment`, at least one. A width of 0 or below does not wrap; a word longer than the
// width stays whole on a line of its own. Advances of tabs are set in the segment on the way, since
// they depend on where a line starts.
[[nodiscard]] std::vector<SegmentLine>
fillLines(Segment& segment, ParagraphFormat const& paragraph, WholeText const& whole, double width);

}  // namespace tzhost
