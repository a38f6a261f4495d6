#pragma once

#include "tz/db/object_id.h"
#include "tz/ge/point3d.h"
#include "tz/text/string.h"

class TzDbEntity;

namespace marks {

// Gives an entity to the active space of the drawing and closes it. When the drawing does not take
// it, the entity is deleted and the id is null.
[[nodiscard]] TzDbObjectId post(TzDbEntity* entity);

// A world point in user coordinates, written in the drawing's units: "1.5000, 2.0000, 0.0000".
[[nodiscard]] TzString inUserUnits(TzGePoint3d const& world);

}  // namespace marks
