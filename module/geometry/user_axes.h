#pragma once

#include "tz/ge/vector3d.h"

// The user system in which a new text lies: that of paper space while the sheet itself is worked
// on, that of model space otherwise.

struct UserAxes {
    TzGeVector3d x;
    TzGeVector3d y;
    TzGeVector3d normal;  // x cross y

    // The axes turned about the normal, radians.
    [[nodiscard]] UserAxes turned(double angle) const;
};

// TILEMODE is 0 and the sheet's own viewport is current.
[[nodiscard]] bool worksOnPaper();
// The axes of the working database's active space, world coordinates.
[[nodiscard]] UserAxes activeUserAxes();
