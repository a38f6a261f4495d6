#pragma once

#include "tz/ge/point2d.h"
#include "tz/ge/vector3d.h"

// A place in space, in drawing units. A plain value; no operation fails.
//
//   TzGePoint3d middle = from + (to - from) / 2;
//   TzGePoint3d onPlane = cursor.orthoProject(plane);
class TzGePoint3d {
public:
    static const TzGePoint3d kOrigin;

    constexpr TzGePoint3d() = default;
    constexpr TzGePoint3d(double xx, double yy, double zz) : x(xx), y(yy), z(zz) {}

    TzGePoint3d& set(double xx, double yy, double zz) { return *this = {xx, yy, zz}; }
    // The coordinate 0, 1 or 2; any other index reads as 2.
    double operator[](int index) const { return index == 0 ? x : index == 1 ? y : z; }
    double& operator[](int index) { return index == 0 ? x : index == 1 ? y : z; }

    constexpr TzGePoint3d operator+(TzGeVector3d const& v) const {
        return {x + v.x, y + v.y, z + v.z};
    }
    constexpr TzGePoint3d operator-(TzGeVector3d const& v) const {
        return {x - v.x, y - v.y, z - v.z};
    }
    constexpr TzGeVector3d operator-(TzGePoint3d const& p) const {
        return {x - p.x, y - p.y, z - p.z};
    }
    TzGePoint3d& operator+=(TzGeVector3d const& v) { return *this = *this + v; }
    TzGePoint3d& operator-=(TzGeVector3d const& v) { return *this = *this - v; }

    // The vector from the origin to this point.
    [[nodiscard]] constexpr TzGeVector3d asVector() const { return {x, y, z}; }
    [[nodiscard]] double distanceTo(TzGePoint3d const& p) const { return (p - *this).length(); }
    // The points are no farther apart than the tolerance; `==` takes the global one.
    [[nodiscard]] bool isEqualTo(TzGePoint3d const& p,
                                 TzGeTol const& tol = TzGeContext::gTol) const {
        return distanceTo(p) <= tol.equalPoint();
    }
    bool operator==(TzGePoint3d const& p) const { return isEqualTo(p); }
    bool operator!=(TzGePoint3d const& p) const { return !isEqualTo(p); }

    // Turns this point by an angle in radians about the axis through `centre`, anticlockwise as
    // seen against the axis.
    TZ_API TzGePoint3d&
    rotateBy(double angle, TzGeVector3d const& axis, TzGePoint3d const& centre = kOrigin);
    TZ_API TzGePoint3d& transformBy(TzGeMatrix3d const& matrix);
    // The point of the plane nearest to this one.
    [[nodiscard]] TZ_API TzGePoint3d orthoProject(TzGePlane const& plane) const;
    // Where the line through this point along a direction meets the plane; this point itself when
    // the direction runs along the plane or is zero.
    [[nodiscard]] TZ_API TzGePoint3d project(TzGePlane const& plane,
                                             TzGeVector3d const& direction) const;
    // Drops z.
    [[nodiscard]] constexpr TzGePoint2d convert2d() const { return {x, y}; }

    double x = 0.0;
    double y = 0.0;
    double z = 0.0;
};

inline constexpr TzGePoint3d TzGePoint3d::kOrigin{};
