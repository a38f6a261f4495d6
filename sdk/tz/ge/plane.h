#pragma once

#include "tz/ge/matrix3d.h"

class TzGeLine3d;

// An unbounded plane with an origin and two axes. A plain value.
//
//   TzGePlane working(matrix.origin(), matrix.zAxis());
//   if (!working.isOn(point)) point = point.orthoProject(working);
class TzGePlane {
public:
    // The plane of the world's X and Y axes.
    TzGePlane() = default;
    // Through a point; the axes follow the arbitrary-axis rule. A zero normal reads as the Z axis.
    TZ_API TzGePlane(TzGePoint3d const& point, TzGeVector3d const& normal);
    // With axes of its own, kept as they are given; parallel or zero ones read as the world's.
    TZ_API
    TzGePlane(TzGePoint3d const& origin, TzGeVector3d const& xAxis, TzGeVector3d const& yAxis);

    TzGePlane& set(TzGePoint3d const& point, TzGeVector3d const& normal) {
        return *this = TzGePlane(point, normal);
    }
    TzGePlane&
    set(TzGePoint3d const& origin, TzGeVector3d const& xAxis, TzGeVector3d const& yAxis) {
        return *this = TzGePlane(origin, xAxis, yAxis);
    }

    [[nodiscard]] TzGePoint3d pointOnPlane() const { return origin_; }
    // Of length 1; the cross product of the axes.
    [[nodiscard]] TzGeVector3d normal() const { return normal_; }
    TZ_API void getCoordSystem(TzGePoint3d& origin, TzGeVector3d& xAxis, TzGeVector3d& yAxis) const;

    // How far the point stands off the plane, positive on the side that the normal points to.
    [[nodiscard]] double signedDistanceTo(TzGePoint3d const& point) const {
        return normal_.dotProduct(point - origin_);
    }
    [[nodiscard]] TZ_API bool isOn(TzGePoint3d const& point,
                                   TzGeTol const& tol = TzGeContext::gTol) const;
    [[nodiscard]] bool isParallelTo(TzGePlane const& other,
                                    TzGeTol const& tol = TzGeContext::gTol) const {
        return normal_.isParallelTo(other.normal_, tol);
    }
    // Where a line meets the plane; false, and `out` unchanged, when it runs along the plane.
    TZ_API bool intersectWith(TzGeLine3d const& line,
                              TzGePoint3d& out,
                              TzGeTol const& tol = TzGeContext::gTol) const;
    // A matrix that flattens the plane to a line leaves the normal as it was.
    TZ_API TzGePlane& transformBy(TzGeMatrix3d const& matrix);

private:
    TzGePoint3d origin_;
    TzGeVector3d xAxis_ = TzGeVector3d::kXAxis;
    TzGeVector3d yAxis_ = TzGeVector3d::kYAxis;
    TzGeVector3d normal_ = TzGeVector3d::kZAxis;
};
