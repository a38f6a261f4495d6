#pragma once

#include "tz/ge/matrix3d.h"

// An unbounded line. A parameter is the distance from the point on line, in drawing units, positive
// along the direction. A plain value.
//
//   TzGeLine3d baseline(first, second - first), across(third, normalToIt);
//   TzGePoint3d corner;
//   if (baseline.intersectWith(across, corner)) ...
class TzGeLine3d {
public:
    // The world's X axis.
    TzGeLine3d() = default;
    // Along a direction of any length; a zero one makes a line that is no more than its point.
    TZ_API TzGeLine3d(TzGePoint3d const& point, TzGeVector3d const& direction);
    // From the first point towards the second.
    TZ_API TzGeLine3d(TzGePoint3d const& first, TzGePoint3d const& second);

    TzGeLine3d& set(TzGePoint3d const& point, TzGeVector3d const& along) {
        return *this = TzGeLine3d(point, along);
    }
    TzGeLine3d& set(TzGePoint3d const& first, TzGePoint3d const& second) {
        return *this = TzGeLine3d(first, second);
    }

    [[nodiscard]] TzGePoint3d pointOnLine() const { return point_; }
    // Of length 1, or exactly zero.
    [[nodiscard]] TzGeVector3d direction() const { return direction_; }

    [[nodiscard]] TzGePoint3d evalPoint(double param) const { return point_ + direction_ * param; }
    // The parameter of the point's foot on the line.
    [[nodiscard]] double paramOf(TzGePoint3d const& point) const {
        return direction_.dotProduct(point - point_);
    }
    // The point's foot on the line; the point itself when it lies on the line within the tolerance.
    [[nodiscard]] TZ_API TzGePoint3d
    getClosestPointTo(TzGePoint3d const& point, TzGeTol const& tol = TzGeContext::gTol) const;
    [[nodiscard]] double distanceTo(TzGePoint3d const& point) const {
        return point.distanceTo(evalPoint(paramOf(point)));
    }
    [[nodiscard]] bool isOn(TzGePoint3d const& point,
                            TzGeTol const& tol = TzGeContext::gTol) const {
        return distanceTo(point) <= tol.equalPoint();
    }
    // Where two lines cross. False, and `out` unchanged, for parallel lines, zero ones, and lines
    // that pass each other at more than the point tolerance (to which the rounding of coordinates
    // as large as these is added).
    TZ_API bool intersectWith(TzGeLine3d const& other,
                              TzGePoint3d& out,
                              TzGeTol const& tol = TzGeContext::gTol) const;
    TZ_API TzGeLine3d& transformBy(TzGeMatrix3d const& matrix);

private:
    TzGePoint3d point_;
    TzGeVector3d direction_ = TzGeVector3d::kXAxis;
};
