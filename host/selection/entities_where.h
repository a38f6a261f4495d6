#pragma once

#include <functional>

#include "host/selection/entity_list.h"
#include "host/selection/outline.h"

namespace tzhost {

// The entities of the active space whose outlines are taken, in drawing order. One that has no part
// in the box may go unasked.
[[nodiscard]] EntityIds entitiesWhere(FlatBox const& box,
                                      std::function<bool(Outline const& outline)> const& takes);

}  // namespace tzhost
