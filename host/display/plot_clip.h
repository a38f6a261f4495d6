#pragma once

#include <vector>

#include "host/layout/layout_types.h"
#include "host/shaping/text_outline.h"

// Cuts paths to a box. A painter counts in numbers of limited size, so that what lies far off the
// page must not reach it.
namespace tzhost {

// Whether any point lies beyond the box.
[[nodiscard]] bool reachesBeyond(std::vector<OutlineStep> const& path, LayoutBox const& box);

// The area that a path fills, within the box: curves become lines, and what lies beyond is moved to
// the edge, so that the number of turns around each point within stays.
[[nodiscard]] std::vector<OutlineStep> clippedArea(std::vector<OutlineStep> const& path,
                                                   LayoutBox const& box);

// A part of a line that lies within the box, and the length of the line before it, for dashes.
struct LinePiece {
    LayoutPoint from;
    LayoutPoint to;
    double before = 0.0;
};
// The parts of a path of straight lines; the close of an outline counts as one.
[[nodiscard]] std::vector<LinePiece> clippedLines(std::vector<OutlineStep> const& path,
                                                  LayoutBox const& box);

}  // namespace tzhost
