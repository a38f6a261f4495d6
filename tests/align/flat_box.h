#pragma once

#include "tz/ge/point3d.h"

// Boxes on the working plane, and how far apart they must stand.
namespace tztest {

struct FlatBox {
    TzGePoint3d low;
    TzGePoint3d high;

    [[nodiscard]] FlatBox by(TzGeVector3d const& offset) const {
        return {low + offset, high + offset};
    }
    [[nodiscard]] bool overlaps(FlatBox const& other) const {
        return low.x < other.high.x && other.low.x < high.x && low.y < other.high.y &&
               other.low.y < high.y;
    }
};

// How far `next` goes along the line until it leaves `here`, when both reference points lie at the
// origin: found by halving, not by the angles of the line.
[[nodiscard]] inline double
touchingDistance(FlatBox const& here, FlatBox const& next, TzGeVector3d const& along) {
    double near = 0;
    double far = 1e6;
    for (int i = 0; i < 80; ++i) {
        double const middle = (near + far) / 2;
        (here.overlaps(next.by(along * middle)) ? near : far) = middle;
    }
    return far;
}

}  // namespace tztest
