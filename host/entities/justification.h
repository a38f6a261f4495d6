#pragma once

#include "host/layout/layout_types.h"
#include "tz/db/text.h"

namespace tzhost {

// The point of a line's layout that lies at its alignment point, in the layout's own frame. Edges
// are those of the text before a style turned it over, so that a justified text, too, is turned
// over about its alignment point. Left, center and right of a vertical text are its start, middle
// and end.
[[nodiscard]] LayoutPoint
anchorOf(LayoutBox const& box, LayoutStyle const& style, TzDbText::Justification justification);

}  // namespace tzhost
