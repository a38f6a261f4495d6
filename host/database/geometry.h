#pragma once

#include <optional>

#include "tz/db/object_id.h"
#include "tz/ge/matrix3d.h"
#include "tz/ge/point3d.h"
#include "tz/ge/vector3d.h"

class TzDbObject;

// Checks and small constructions that several entities share. Coordinates are world coordinates.
namespace tzhost {

[[nodiscard]] bool isFinite(TzGePoint3d const& point);
[[nodiscard]] bool isFinite(TzGeVector3d const& vector);
[[nodiscard]] bool isFinite(TzGeMatrix3d const& matrix);
// Finite and above 0.
[[nodiscard]] bool isPositive(double value);
// Finite and 0 or more.
[[nodiscard]] bool isSize(double value);
// Finite, with a direction.
[[nodiscard]] bool isDirection(TzGeVector3d const& vector);

// The vector at length 1; one that has that length but for rounding is kept bit for bit, so that
// what was saved reads back the same.
[[nodiscard]] TzGeVector3d unitVector(TzGeVector3d const& vector);
// The unit vector at a right angle to `normal` that is nearest to `vector`, kept bit for bit when
// it is one. Neither may be zero, nor may they be parallel.
[[nodiscard]] TzGeVector3d perpendicularTo(TzGeVector3d const& normal, TzGeVector3d const& vector);

// The angle from `from` to `to` about a normal, 0 or more and below two pi.
[[nodiscard]] double
angleAbout(TzGeVector3d const& normal, TzGeVector3d const& from, TzGeVector3d const& to);

// The direction of an angle in the plane of a normal, counted from the arbitrary axis.
[[nodiscard]] TzGeVector3d directionAt(TzGeVector3d const& normal, double radians);

// Where a flat entity goes and by what it grows along its direction and up from it.
struct Transformed {
    TzGePoint3d origin;
    TzGeVector3d normal;
    TzGeVector3d direction;
    double scaleAlong = 1.0;
    double scaleUp = 1.0;

    [[nodiscard]] bool isScaled() const { return scaleAlong != 1.0 || scaleUp != 1.0; }
};
// Nothing when a coordinate would not be finite or a direction would vanish. Factors that differ
// from 1 by rounding alone are 1, so that moving and turning measure nothing anew. A mirrored
// entity is read from the other side.
[[nodiscard]] std::optional<Transformed> transformed(TzGeMatrix3d const& matrix,
                                                     TzGePoint3d const& origin,
                                                     TzGeVector3d const& normal,
                                                     TzGeVector3d const& direction);

// Whether an id may be stored in an object: of its own database, or of any when it is in none.
[[nodiscard]] bool fitsDatabase(TzDbObject const& object, TzDbObjectId id);

}  // namespace tzhost
