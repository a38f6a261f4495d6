#pragma once

#include <vector>

#include "host/layout/text_line.h"

// Turns markup that was read into shaped segments, one for each stretch between line ends.
namespace tzhost {

// The looks of `markup`, in its order, with faces chosen; entry 0 of its fonts is `style`'s.
[[nodiscard]] std::vector<LineFormat> lineFormatsOf(MarkupText const& markup,
                                                    LayoutStyle const& style);

// The segments of `markup`, at least one. Control characters but the tab draw nothing and are left
// out.
[[nodiscard]] std::vector<Segment> buildSegments(MarkupText const& markup,
                                                 std::vector<LineFormat> const& formats,
                                                 WholeText const& whole);

}  // namespace tzhost
