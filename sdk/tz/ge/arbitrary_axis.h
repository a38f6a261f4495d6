#pragma once

#include "tz/ge/matrix3d.h"

// The rule that gives a flat entity axes of its own when only its normal is known, so that
// everybody who reads the drawing finds the same ones.
//
//   TzGeMatrix3d ecs = atwt(text->normal());   // its columns are the X, Y and Z axes

// The X axis that goes with a normal, of length 1: the world's Y axis crossed with the normal when
// both |x| and |y| of the unit normal are below 1/64, else the world's Z axis crossed with it. A
// zero normal reads as the Z axis.
[[nodiscard]] TZ_API TzGeVector3d tzgeArbitraryXAxis(TzGeVector3d const& normal);

// The matrix of that system at the world's origin: the columns are the arbitrary X axis, the Y axis
// that completes it, and the normal, each of length 1.
[[nodiscard]] TZ_API TzGeMatrix3d atwt(TzGeVector3d const& normal);
