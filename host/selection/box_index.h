#pragma once

#include <vector>

#include "host/selection/outline.h"

struct TzDbObjectRecord;

namespace tzhost {

// The items of a list that can have a part in a box of the user system, in the order of the list;
// `owner` lists them, and `placed` maps their coordinates to world coordinates. What is left out
// has no part there, so whoever looks at each item that is given finds what a walk over the whole
// list would find.
//
// Long lists that are asked again and again have an index of boxes, which follows the changes of
// the drawing; for others all items are given. A null owner has none.
[[nodiscard]] std::vector<TzDbObjectRecord*>
itemsNear(TzDbObjectRecord const* owner, TzGeMatrix3d const& placed, FlatBox const& box);

// The same with a point, and whether only those are given whose boxes hold it: the box around all
// that a reference draws need not be drawn again for each pick.
struct ItemsAtPoint {
    std::vector<TzDbObjectRecord*> items;
    bool boxesHoldIt = false;
};
[[nodiscard]] ItemsAtPoint
itemsAt(TzDbObjectRecord const* owner, TzGeMatrix3d const& placed, TzGePoint2d const& point);

}  // namespace tzhost
