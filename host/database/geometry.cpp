#include "host/database/geometry.h"

#include <cmath>

#include "tz/db/object.h"
#include "tz/ge/arbitrary_axis.h"

namespace tzhost {
namespace {

constexpr double kRounding = 4e-15;  // of a unit vector's length and of a right angle
constexpr double kFullTurn = 6.283185307179586476925286766559;

}  // namespace

bool isFinite(TzGePoint3d const& point) {
    return std::isfinite(point.x) && std::isfinite(point.y) && std::isfinite(point.z);
}

bool isFinite(TzGeVector3d const& vector) {
    return std::isfinite(vector.x) && std::isfinite(vector.y) && std::isfinite(vector.z);
}

bool isFinite(TzGeMatrix3d const& matrix) {
    return isFinite(matrix.xAxis()) && isFinite(matrix.yAxis()) && isFinite(matrix.zAxis()) &&
           isFinite(matrix.origin());
}

bool isPositive(double value) {
    return std::isfinite(value) && value > 0.0;
}

bool isSize(double value) {
    return std::isfinite(value) && value >= 0.0;
}

bool isDirection(TzGeVector3d const& vector) {
    return isFinite(vector) && std::isfinite(vector.length()) && !vector.isZeroLength();
}

TzGeVector3d unitVector(TzGeVector3d const& vector) {
    return std::abs(vector.length() - 1.0) <= kRounding ? vector : vector.normal();
}

// What is left of a vector that is close to the normal has lost most of its digits, so that it
// stands at no right angle yet: another turn makes up for it. A result goes in and comes out
// unchanged.
TzGeVector3d perpendicularTo(TzGeVector3d const& normal, TzGeVector3d const& vector) {
    constexpr int kMostTurns = 4;
    TzGeVector3d unit = unitVector(vector);
    for (int turn = 0; turn < kMostTurns; ++turn) {
        double const along = unit.dotProduct(normal);
        if (std::abs(along) <= kRounding) break;
        unit = unitVector(unit - normal * along);
    }
    return unit;
}

double angleAbout(TzGeVector3d const& normal, TzGeVector3d const& from, TzGeVector3d const& to) {
    double const angle = std::atan2(from.crossProduct(to).dotProduct(normal), from.dotProduct(to));
    double const turned = angle < 0.0 ? angle + kFullTurn : angle;
    return turned >= kFullTurn ? 0.0 : turned;
}

TzGeVector3d directionAt(TzGeVector3d const& normal, double radians) {
    return tzgeArbitraryXAxis(normal).rotateBy(radians, normal);
}

std::optional<Transformed> transformed(TzGeMatrix3d const& matrix,
                                       TzGePoint3d const& origin,
                                       TzGeVector3d const& normal,
                                       TzGeVector3d const& direction) {
    Transformed result;
    result.origin = matrix * origin;
    TzGeVector3d const along = matrix * direction;
    TzGeVector3d const up = matrix * normal.crossProduct(direction);
    result.scaleAlong = along.length();
    result.direction = unitVector(along / result.scaleAlong);
    TzGeVector3d const across = result.direction.crossProduct(up);
    result.scaleUp = across.length();
    result.normal = unitVector(across / result.scaleUp);
    if (!isFinite(result.origin) || !isFinite(result.direction) || !isFinite(result.normal)) {
        return std::nullopt;
    }
    constexpr double kSameSize = 1e-14;
    if (std::abs(result.scaleAlong - 1.0) <= kSameSize) result.scaleAlong = 1.0;
    if (std::abs(result.scaleUp - 1.0) <= kSameSize) result.scaleUp = 1.0;
    return result;
}

bool fitsDatabase(TzDbObject const& object, TzDbObjectId id) {
    return !object.database() || object.database() == id.database();
}

}  // namespace tzhost
