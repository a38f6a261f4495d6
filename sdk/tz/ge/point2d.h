#pragma once

#include "tz/ge/vector2d.h"

// A place in a plane, in drawing units. A plain value; no operation fails.
//
//   TzGePoint2d corner = TzGePoint2d(1, 2) + TzGeVector2d(3, 0);   // 4,2
class TzGePoint2d {
public:
    static const TzGePoint2d kOrigin;

    constexpr TzGePoint2d() = default;
    constexpr TzGePoint2d(double xx, double yy) : x(xx), y(yy) {}

    TzGePoint2d& set(double xx, double yy) { return *this = {xx, yy}; }
    constexpr TzGePoint2d operator+(TzGeVector2d const& v) const { return {x + v.x, y + v.y}; }
    constexpr TzGePoint2d operator-(TzGeVector2d const& v) const { return {x - v.x, y - v.y}; }
    constexpr TzGeVector2d operator-(TzGePoint2d const& p) const { return {x - p.x, y - p.y}; }
    TzGePoint2d& operator+=(TzGeVector2d const& v) { return *this = *this + v; }
    TzGePoint2d& operator-=(TzGeVector2d const& v) { return *this = *this - v; }

    [[nodiscard]] constexpr TzGeVector2d asVector() const { return {x, y}; }
    [[nodiscard]] double distanceTo(TzGePoint2d const& p) const { return (p - *this).length(); }
    // The points are no farther apart than the tolerance; `==` takes the global one.
    [[nodiscard]] bool isEqualTo(TzGePoint2d const& p,
                                 TzGeTol const& tol = TzGeContext::gTol) const {
        return distanceTo(p) <= tol.equalPoint();
    }
    bool operator==(TzGePoint2d const& p) const { return isEqualTo(p); }
    bool operator!=(TzGePoint2d const& p) const { return !isEqualTo(p); }

    double x = 0.0;
    double y = 0.0;
};

inline constexpr TzGePoint2d TzGePoint2d::kOrigin{};
