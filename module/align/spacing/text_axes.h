#pragma once

#include "tz/ge/matrix3d.h"

// The frame of a single-line text, mapped to world coordinates: the arbitrary axes of its normal,
// turned by its rotation in radians, at its position.
[[nodiscard]] TzGeMatrix3d
calculateObjEcs(TzGePoint3d const& position, TzGeVector3d const& normal, double rotation);
