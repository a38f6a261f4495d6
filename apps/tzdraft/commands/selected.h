#pragma once

#include <vector>

#include "tz/db/object_id.h"

// What a command works on: the selection made before it, else what the user selects.
namespace tzdraft {

enum class OnLockedLayers { included, leftOut };

// Empty when nothing is selected and after a cancel.
[[nodiscard]] std::vector<TzDbObjectId> selectEntities(OnLockedLayers locked);

}  // namespace tzdraft
