#pragma once

#include "tz/export.h"
#include "tz/ge/point3d.h"
#include "tz/pal/windows_calls.h"

// Where places of the drawing lie on the screen. VIEWCTR stands in the middle of the drawing area,
// VIEWSIZE is its height in drawing units, and VIEWDIR tells from where one looks. Paper space is
// always seen from above.
//
//   POINT pixel{};
//   if (tzedCoordFromWorldToPixel(viewport, location, pixel)) ClientToScreen(area, &pixel);

// [any] The pixel of the drawing area that shows a world point: x to the right and y downwards from
// its top left corner, outside the area as well. `viewport` is a value of CVPORT; 1 is paper space
// unless TILEMODE is 1. False, with `pixel` left alone, for a viewport below 1 and for a point that
// is not finite or lies farther off than a pixel can tell.
TZ_API bool tzedCoordFromWorldToPixel(int viewport, TzGePoint3d const& world, POINT& pixel);
// [any] The point that a pixel shows: in the plane through VIEWCTR that faces the viewer, or
// through the origin in paper space. False for a viewport below 1.
TZ_API bool tzedCoordFromPixelToWorld(int viewport, POINT const& pixel, TzGePoint3d& world);
