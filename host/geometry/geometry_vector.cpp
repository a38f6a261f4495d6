#include <cmath>
#include <numbers>

#include "tz/ge/arbitrary_axis.h"
#include "tz/ge/matrix3d.h"
#include "tz/ge/plane.h"
#include "tz/ge/vector2d.h"
#include "tz/ge/vector3d.h"

namespace {

// Products of such lengths, and of their squares, are exact to the last digits.
bool isOrdinary(double squaredLength) {
    return squaredLength > 1e-100 && squaredLength < 1e100;
}

// Whether the products of two vectors tell, without a root, that they run in directions which no
// small tolerance takes for parallel: within 1e-5 the squared cosine is above 1 - 1e-10.
bool areFarFromParallel(TzGeVector3d const& a, TzGeVector3d const& b, TzGeTol const& tol) {
    double const along = a.dotProduct(b);
    double const aa = a.dotProduct(a);
    double const bb = b.dotProduct(b);
    return tol.equalVector() <= 1e-5 && isOrdinary(aa) && isOrdinary(bb) &&
           along * along < aa * bb * (1 - 1e-9);
}

}  // namespace

double TzGeVector2d::length() const {
    return std::hypot(x, y);
}

TzGeVector2d TzGeVector2d::normal(TzGeTol const& tol) const {
    return isZeroLength(tol) ? *this : *this / length();
}

double TzGeVector2d::angle() const {
    if (isZeroLength()) return 0.0;
    double const signedAngle = std::atan2(y, x);
    double const turned = signedAngle < 0.0 ? signedAngle + 2.0 * std::numbers::pi : signedAngle;
    // An angle just below zero rounds up to the full turn, which is the X axis again.
    return turned < 2.0 * std::numbers::pi ? turned : 0.0;
}

TzGeVector2d& TzGeVector2d::rotateBy(double angle) {
    double const cosine = std::cos(angle);
    double const sine = std::sin(angle);
    return *this = {x * cosine - y * sine, x * sine + y * cosine};
}

bool TzGeVector2d::isEqualTo(TzGeVector2d const& v, TzGeTol const& tol) const {
    return (*this - v).length() <= tol.equalVector();
}

double TzGeVector3d::length() const {
    return std::hypot(x, y, z);
}

TzGeVector3d TzGeVector3d::normal(TzGeTol const& tol) const {
    return isZeroLength(tol) ? *this : *this / length();
}

TzGeVector3d TzGeVector3d::crossProduct(TzGeVector3d const& v) const {
    return {y * v.z - z * v.y, z * v.x - x * v.z, x * v.y - y * v.x};
}

double TzGeVector3d::angleTo(TzGeVector3d const& v) const {
    if (isZeroLength() || v.isZeroLength()) return 0.0;
    TzGeVector3d const a = normal();
    TzGeVector3d const b = v.normal();
    // The tangent keeps its digits near 0 and pi, where the cosine loses half of them.
    return std::atan2(a.crossProduct(b).length(), a.dotProduct(b));
}

bool TzGeVector3d::isParallelTo(TzGeVector3d const& v, TzGeTol const& tol) const {
    if (areFarFromParallel(*this, v, tol)) return false;
    return isCodirectionalTo(v, tol) || isCodirectionalTo(-v, tol);
}

bool TzGeVector3d::isCodirectionalTo(TzGeVector3d const& v, TzGeTol const& tol) const {
    if (isZeroLength(tol) || v.isZeroLength(tol)) return false;
    return (normal(tol) - v.normal(tol)).length() <= tol.equalVector();
}

bool TzGeVector3d::isPerpendicularTo(TzGeVector3d const& v, TzGeTol const& tol) const {
    if (isZeroLength(tol) || v.isZeroLength(tol)) return false;
    return std::fabs(normal(tol).dotProduct(v.normal(tol))) <= tol.equalVector();
}

bool TzGeVector3d::isEqualTo(TzGeVector3d const& v, TzGeTol const& tol) const {
    return (*this - v).length() <= tol.equalVector();
}

TzGeVector3d& TzGeVector3d::rotateBy(double angle, TzGeVector3d const& axis) {
    if (axis.isZeroLength()) return *this;
    TzGeVector3d const k = axis.normal();
    double const cosine = std::cos(angle);
    TzGeVector3d const along = k * (k.dotProduct(*this) * (1.0 - cosine));
    return *this = *this * cosine + k.crossProduct(*this) * std::sin(angle) + along;
}

TzGeVector3d& TzGeVector3d::transformBy(TzGeMatrix3d const& matrix) {
    auto const& m = matrix.entry;
    return *this = {m[0][0] * x + m[0][1] * y + m[0][2] * z,
                    m[1][0] * x + m[1][1] * y + m[1][2] * z,
                    m[2][0] * x + m[2][1] * y + m[2][2] * z};
}

TzGeVector3d TzGeVector3d::orthoProject(TzGePlane const& plane) const {
    return project(plane, plane.normal());
}

TzGeVector3d TzGeVector3d::project(TzGePlane const& plane, TzGeVector3d const& direction) const {
    TzGeVector3d const normal = plane.normal();
    if (direction.isZeroLength() || direction.isPerpendicularTo(normal)) return *this;
    return *this - direction * (dotProduct(normal) / direction.dotProduct(normal));
}

TzGeVector3d TzGeVector3d::perpVector() const {
    return tzgeArbitraryXAxis(*this);
}
