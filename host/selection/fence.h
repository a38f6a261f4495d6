#pragma once

#include <optional>
#include <vector>

#include "host/selection/entity_list.h"
#include "tz/ge/point3d.h"

// A fence: a line through points of the user system, which selects what it crosses.
namespace tzhost {

using FencePoints = std::vector<TzGePoint3d>;

// The entities of the active space that the line crosses, by the outlines that a crossing goes by,
// seen along the Z axis of the user system. A line of fewer than two points crosses nothing.
[[nodiscard]] EntityIds entitiesAcross(FencePoints const& fence);

// Asks for one point after another until Enter; drags show the line on its way to the cursor, and
// "Undo" takes the last point back. Nothing after a cancel.
[[nodiscard]] std::optional<FencePoints> askFence();

}  // namespace tzhost
