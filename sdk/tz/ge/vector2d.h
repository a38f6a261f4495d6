#pragma once

#include "tz/export.h"
#include "tz/ge/tol.h"

// A direction with a length in a plane, in drawing units. A plain value; no operation fails.
//
//   TzGeVector2d up = TzGeVector2d::kXAxis.perpVector();   // 0,1
class TzGeVector2d {
public:
    static const TzGeVector2d kIdentity;
    static const TzGeVector2d kXAxis;
    static const TzGeVector2d kYAxis;

    constexpr TzGeVector2d() = default;
    constexpr TzGeVector2d(double xx, double yy) : x(xx), y(yy) {}

    constexpr TzGeVector2d operator-() const { return {-x, -y}; }
    constexpr TzGeVector2d operator+(TzGeVector2d const& v) const { return {x + v.x, y + v.y}; }
    constexpr TzGeVector2d operator-(TzGeVector2d const& v) const { return {x - v.x, y - v.y}; }
    constexpr TzGeVector2d operator*(double factor) const { return {x * factor, y * factor}; }
    constexpr TzGeVector2d operator/(double divisor) const { return {x / divisor, y / divisor}; }
    TzGeVector2d& operator+=(TzGeVector2d const& v) { return *this = *this + v; }
    TzGeVector2d& operator-=(TzGeVector2d const& v) { return *this = *this - v; }
    TzGeVector2d& operator*=(double factor) { return *this = *this * factor; }
    TzGeVector2d& operator/=(double divisor) { return *this = *this / divisor; }

    [[nodiscard]] TZ_API double length() const;
    [[nodiscard]] bool isZeroLength(TzGeTol const& tol = TzGeContext::gTol) const {
        return length() <= tol.equalVector();
    }
    // This direction at length 1; a zero vector comes back as it is.
    [[nodiscard]] TZ_API TzGeVector2d normal(TzGeTol const& tol = TzGeContext::gTol) const;
    TzGeVector2d& normalize(TzGeTol const& tol = TzGeContext::gTol) { return *this = normal(tol); }
    [[nodiscard]] constexpr double dotProduct(TzGeVector2d const& v) const {
        return x * v.x + y * v.y;
    }
    // This vector turned a quarter anticlockwise.
    [[nodiscard]] constexpr TzGeVector2d perpVector() const { return {-y, x}; }
    // The angle from the X axis, in radians, 0 up to but not including two pi; 0 for a zero vector.
    [[nodiscard]] TZ_API double angle() const;
    // Turns this vector anticlockwise by an angle in radians.
    TZ_API TzGeVector2d& rotateBy(double angle);
    // The vectors' difference is no longer than the tolerance; `==` takes the global one.
    [[nodiscard]] TZ_API bool isEqualTo(TzGeVector2d const& v,
                                        TzGeTol const& tol = TzGeContext::gTol) const;
    bool operator==(TzGeVector2d const& v) const { return isEqualTo(v); }
    bool operator!=(TzGeVector2d const& v) const { return !isEqualTo(v); }

    double x = 0.0;
    double y = 0.0;
};

inline constexpr TzGeVector2d TzGeVector2d::kIdentity{};
inline constexpr TzGeVector2d TzGeVector2d::kXAxis{1.0, 0.0};
inline constexpr TzGeVector2d TzGeVector2d::kYAxis{0.0, 1.0};

[[nodiscard]] constexpr TzGeVector2d operator*(double factor, TzGeVector2d const& v) {
    return v * factor;
}
