#pragma once

#include "host/layout/text_line.h"

// Turns a line that has its place into the runs and rules of the result.
namespace tzhost {

// Adds what is drawn of `line` to `layout`, its start at `origin`. Underlines and overlines run on
// through changes of font and height, at the distance of the largest letters they belong to.
void drawLine(Segment const& segment,
              SegmentLine const& line,
              std::vector<LineFormat> const& formats,
              WholeText const& whole,
              LayoutPoint origin,
              MTextLayout& layout);

// Adds a stack, its start on the baseline at `origin`.
void drawStack(LaidStack const& stack, LayoutPoint origin, MTextLayout& layout);

}  // namespace tzhost
