#include "tz/db/shapes.h"

#include "host/base/entity_drawing.h"
#include "host/database/geometry.h"
#include "host/entities/shape_imp.h"
#include "tz/gi/draw.h"

using tzhost::assign;
using tzhost::CircleImp;
using tzhost::faultStatus;
using tzhost::LineImp;
using tzhost::valuesOf;

TzDbLine::TzDbLine() : TzDbEntity(new LineImp) {}

TzDbLine::~TzDbLine() = default;

TzGePoint3d TzDbLine::startPoint() const {
    return valuesOf<LineImp>(*this).start;
}

TzGePoint3d TzDbLine::endPoint() const {
    return valuesOf<LineImp>(*this).end;
}

Tzad::ErrorStatus TzDbLine::setStartPoint(TzGePoint3d const& point) {
    return assign(*this, "TzDbLine::setStartPoint", &LineImp::start, point, tzhost::isFinite(point),
                  Tzad::eDegenerateGeometry);
}

Tzad::ErrorStatus TzDbLine::setEndPoint(TzGePoint3d const& point) {
    return assign(*this, "TzDbLine::setEndPoint", &LineImp::end, point, tzhost::isFinite(point),
                  Tzad::eDegenerateGeometry);
}

bool TzDbLine::subWorldDraw(TzGiWorldDraw* draw) {
    if (!draw || tzhost::takenWhole(draw, *this, L"LINE", startPoint())) return true;
    TzGePoint3d const points[] = {startPoint(), endPoint()};
    draw->geometry().polyline(2, points);
    return true;
}

Tzad::ErrorStatus TzDbLine::subTransformBy(TzGeMatrix3d const& matrix) {
    TzGePoint3d const start = matrix * startPoint();
    TzGePoint3d const end = matrix * endPoint();
    if (!tzhost::isFinite(start) || !tzhost::isFinite(end)) return Tzad::eDegenerateGeometry;
    if (auto const status = tzhost::beginChange(*this)) return status;
    valuesOf<LineImp>(*this).start = start;
    valuesOf<LineImp>(*this).end = end;
    return Tzad::eOk;
}

TzDbCircle::TzDbCircle() : TzDbEntity(new CircleImp) {}

TzDbCircle::~TzDbCircle() = default;

TzGePoint3d TzDbCircle::center() const {
    return valuesOf<CircleImp>(*this).center;
}

Tzad::ErrorStatus TzDbCircle::setCenter(TzGePoint3d const& center) {
    return assign(*this, "TzDbCircle::setCenter", &CircleImp::center, center,
                  tzhost::isFinite(center), Tzad::eDegenerateGeometry);
}

TzGeVector3d TzDbCircle::normal() const {
    return valuesOf<CircleImp>(*this).normal;
}

Tzad::ErrorStatus TzDbCircle::setNormal(TzGeVector3d const& normal) {
    bool const valid = tzhost::isDirection(normal);
    return assign(*this, "TzDbCircle::setNormal", &CircleImp::normal,
                  valid ? tzhost::unitVector(normal) : normal, valid, Tzad::eDegenerateGeometry);
}

double TzDbCircle::radius() const {
    return valuesOf<CircleImp>(*this).radius;
}

Tzad::ErrorStatus TzDbCircle::setRadius(double radius) {
    return assign(*this, "TzDbCircle::setRadius", &CircleImp::radius, radius,
                  tzhost::isPositive(radius));
}

bool TzDbCircle::subWorldDraw(TzGiWorldDraw* draw) {
    if (!draw || tzhost::takenWhole(draw, *this, L"CIRCLE", center())) return true;
    draw->geometry().circle(center(), radius(), normal());
    return true;
}

// A circle stays a circle: it grows by what its X axis does.
Tzad::ErrorStatus TzDbCircle::subTransformBy(TzGeMatrix3d const& matrix) {
    CircleImp const& now = valuesOf<CircleImp>(*this);
    auto const turned =
        tzhost::transformed(matrix, now.center, now.normal, tzhost::directionAt(now.normal, 0.0));
    if (!turned || !tzhost::isPositive(now.radius * turned->scaleAlong)) {
        return Tzad::eDegenerateGeometry;
    }
    if (auto const status = tzhost::beginChange(*this)) return status;
    CircleImp& values = valuesOf<CircleImp>(*this);
    values.center = turned->origin;
    values.normal = turned->normal;
    values.radius *= turned->scaleAlong;
    return Tzad::eOk;
}
