#pragma once

#include "tz/export.h"

class TzGeMatrix3d;

// The user coordinate system of the active space. Coordinates are arrays of three; input and output
// may be the same array.

// [any] User to world and back; a vector is turned but not moved. False leaves the output alone.
TZ_API bool tzdbUcs2Wcs(double const* user, double* world, bool isVector);
TZ_API bool tzdbWcs2Ucs(double const* world, double* user, bool isVector);
// [command] Makes a system current and keeps the previous one on a stack; 0 or a failing status.
// The matrix maps user to world and must be orthonormal and right-handed.
[[nodiscard]] TZ_API int tzedSetCurrentUCS(TzGeMatrix3d const& system);
// [command] Takes the last remembered system back; a failing status when there is none.
TZ_API int tzedRestorePreviousUCS();
// [any] The current system, as a matrix from user to world.
[[nodiscard]] TZ_API int tzedGetCurrentUCS(TzGeMatrix3d& system);
