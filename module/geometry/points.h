#pragma once

#include "tz/ge/point3d.h"

// Points as the three coordinates that questions and options keep, and back.

[[nodiscard]] constexpr TzGePoint3d pointOf(double const (&coordinates)[3]) {
    return {coordinates[0], coordinates[1], coordinates[2]};
}

constexpr void setCoordinates(double (&coordinates)[3], TzGePoint3d const& point) {
    coordinates[0] = point.x;
    coordinates[1] = point.y;
    coordinates[2] = point.z;
}
