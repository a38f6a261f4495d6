#pragma once

#include "tz/export.h"
#include "tz/ge/tol.h"
#include "tz/ge/vector2d.h"

class TzGeMatrix3d;
class TzGePlane;

// A direction with a length in space, in drawing units. A plain value; no operation fails. A vector
// no longer than the vector tolerance is zero: it has no direction, so normalising leaves it as it
// is, and it is neither parallel nor perpendicular to anything.
//
//   TzGeVector3d direction = TzGeVector3d::kXAxis;
//   direction.rotateBy(angle, normal).normalize();
class TzGeVector3d {
public:
    static const TzGeVector3d kIdentity;
    static const TzGeVector3d kXAxis;
    static const TzGeVector3d kYAxis;
    static const TzGeVector3d kZAxis;

    constexpr TzGeVector3d() = default;
    constexpr TzGeVector3d(double xx, double yy, double zz) : x(xx), y(yy), z(zz) {}

    TzGeVector3d& set(double xx, double yy, double zz) { return *this = {xx, yy, zz}; }
    // The component 0, 1 or 2; any other index reads as 2.
    double operator[](int index) const { return index == 0 ? x : index == 1 ? y : z; }
    double& operator[](int index) { return index == 0 ? x : index == 1 ? y : z; }

    constexpr TzGeVector3d operator-() const { return {-x, -y, -z}; }
    constexpr TzGeVector3d operator+(TzGeVector3d const& v) const {
        return {x + v.x, y + v.y, z + v.z};
    }
    constexpr TzGeVector3d operator-(TzGeVector3d const& v) const {
        return {x - v.x, y - v.y, z - v.z};
    }
    constexpr TzGeVector3d operator*(double factor) const {
        return {x * factor, y * factor, z * factor};
    }
    constexpr TzGeVector3d operator/(double divisor) const {
        return {x / divisor, y / divisor, z / divisor};
    }
    TzGeVector3d& operator+=(TzGeVector3d const& v) { return *this = *this + v; }
    TzGeVector3d& operator-=(TzGeVector3d const& v) { return *this = *this - v; }
    TzGeVector3d& operator*=(double factor) { return *this = *this * factor; }
    TzGeVector3d& operator/=(double divisor) { return *this = *this / divisor; }
    TzGeVector3d& negate() { return *this = -*this; }

    [[nodiscard]] TZ_API double length() const;
    [[nodiscard]] bool isZeroLength(TzGeTol const& tol = TzGeContext::gTol) const {
        return length() <= tol.equalVector();
    }
    // This direction at length 1; a zero vector comes back as it is.
    [[nodiscard]] TZ_API TzGeVector3d normal(TzGeTol const& tol = TzGeContext::gTol) const;
    TzGeVector3d& normalize(TzGeTol const& tol = TzGeContext::gTol) { return *this = normal(tol); }
    [[nodiscard]] constexpr double dotProduct(TzGeVector3d const& v) const {
        return x * v.x + y * v.y + z * v.z;
    }
    [[nodiscard]] TZ_API TzGeVector3d crossProduct(TzGeVector3d const& v) const;

    // The unsigned angle between the two directions, 0 to pi radians; 0 when one of them is zero.
    [[nodiscard]] TZ_API double angleTo(TzGeVector3d const& v) const;
    // The two run along one line, in either sense; their unit vectors are compared.
    [[nodiscard]] TZ_API bool isParallelTo(TzGeVector3d const& v,
                                           TzGeTol const& tol = TzGeContext::gTol) const;
    // Parallel and in the same sense.
    [[nodiscard]] TZ_API bool isCodirectionalTo(TzGeVector3d const& v,
                                                TzGeTol const& tol = TzGeContext::gTol) const;
    // The two stand at a right angle; their unit vectors are compared.
    [[nodiscard]] TZ_API bool isPerpendicularTo(TzGeVector3d const& v,
                                                TzGeTol const& tol = TzGeContext::gTol) const;
    // The vectors' difference is no longer than the tolerance; `==` takes the global one.
    [[nodiscard]] TZ_API bool isEqualTo(TzGeVector3d const& v,
                                        TzGeTol const& tol = TzGeContext::gTol) const;
    bool operator==(TzGeVector3d const& v) const { return isEqualTo(v); }
    bool operator!=(TzGeVector3d const& v) const { return !isEqualTo(v); }

    // Turns this vector by an angle in radians, anticlockwise as seen against the axis; an axis of
    // any length but zero, about which nothing turns.
    TZ_API TzGeVector3d& rotateBy(double angle, TzGeVector3d const& axis);
    // Applies the matrix without its translation.
    TZ_API TzGeVector3d& transformBy(TzGeMatrix3d const& matrix);
    // The part of this vector that lies in the plane.
    [[nodiscard]] TZ_API TzGeVector3d orthoProject(TzGePlane const& plane) const;
    // This vector's shadow on the plane along a direction; this vector itself when the direction
    // runs along the plane or is zero.
    [[nodiscard]] TZ_API TzGeVector3d project(TzGePlane const& plane,
                                              TzGeVector3d const& direction) const;
    // Any one vector of length 1 at a right angle to this one, always the same for the same vector:
    // the X axis that the arbitrary-axis rule gives.
    [[nodiscard]] TZ_API TzGeVector3d perpVector() const;
    // Drops z.
    [[nodiscard]] constexpr TzGeVector2d convert2d() const { return {x, y}; }

    double x = 0.0;
    double y = 0.0;
    double z = 0.0;
};

inline constexpr TzGeVector3d TzGeVector3d::kIdentity{};
inline constexpr TzGeVector3d TzGeVector3d::kXAxis{1.0, 0.0, 0.0};
inline constexpr TzGeVector3d TzGeVector3d::kYAxis{0.0, 1.0, 0.0};
inline constexpr TzGeVector3d TzGeVector3d::kZAxis{0.0, 0.0, 1.0};

[[nodiscard]] constexpr TzGeVector3d operator*(double factor, TzGeVector3d const& v) {
    return v * factor;
}
