#include <algorithm>
#include <cmath>

#include "tz/ge/matrix3d.h"
#include "tz/ge/plane.h"

namespace {

// The matrix whose axes are the images of the world's axes under `turn`, and which leaves `fixed`
// in its place.
template <class Turn>
TzGeMatrix3d matrixAbout(TzGePoint3d const& fixed, Turn turn) {
    TzGeVector3d const x = turn(TzGeVector3d::kXAxis);
    TzGeVector3d const y = turn(TzGeVector3d::kYAxis);
    TzGeVector3d const z = turn(TzGeVector3d::kZAxis);
    return TzGeMatrix3d().setCoordSystem(fixed - turn(fixed.asVector()), x, y, z);
}

}  // namespace

TzGeMatrix3d TzGeMatrix3d::translation(TzGeVector3d const& offset) {
    return TzGeMatrix3d().setCoordSystem(TzGePoint3d::kOrigin + offset, TzGeVector3d::kXAxis,
                                         TzGeVector3d::kYAxis, TzGeVector3d::kZAxis);
}

TzGeMatrix3d
TzGeMatrix3d::rotation(double angle, TzGeVector3d const& axis, TzGePoint3d const& centre) {
    return matrixAbout(centre, [&](TzGeVector3d v) { return v.rotateBy(angle, axis); });
}

TzGeMatrix3d TzGeMatrix3d::scaling(double factor, TzGePoint3d const& centre) {
    return matrixAbout(centre, [&](TzGeVector3d v) { return v * factor; });
}

TzGeMatrix3d TzGeMatrix3d::projection(TzGePlane const& plane, TzGeVector3d const& direction) {
    return matrixAbout(plane.pointOnPlane(),
                       [&](TzGeVector3d v) { return v.project(plane, direction); });
}

TzGeMatrix3d& TzGeMatrix3d::setCoordSystem(TzGePoint3d const& origin,
                                           TzGeVector3d const& xAxis,
                                           TzGeVector3d const& yAxis,
                                           TzGeVector3d const& zAxis) {
    for (int row = 0; row < 3; ++row) {
        entry[row][0] = xAxis[row];
        entry[row][1] = yAxis[row];
        entry[row][2] = zAxis[row];
        entry[row][3] = origin[row];
    }
    return *this;
}

void TzGeMatrix3d::getCoordSystem(TzGePoint3d& origin,
                                  TzGeVector3d& xAxis,
                                  TzGeVector3d& yAxis,
                                  TzGeVector3d& zAxis) const {
    origin = this->origin();
    xAxis = axis(0);
    yAxis = axis(1);
    zAxis = axis(2);
}

TzGeMatrix3d TzGeMatrix3d::operator*(TzGeMatrix3d const& right) const {
    return TzGeMatrix3d().setCoordSystem(
        right.origin().transformBy(*this), right.axis(0).transformBy(*this),
        right.axis(1).transformBy(*this), right.axis(2).transformBy(*this));
}

TzGeMatrix3d TzGeMatrix3d::inverse() const {
    double const volume = det();
    if (volume == 0.0 || isSingular()) return TzGeMatrix3d();
    // The rows of the inverse are the cross products of the columns.
    TzGeVector3d const rows[] = {axis(1).crossProduct(axis(2)) / volume,
                                 axis(2).crossProduct(axis(0)) / volume,
                                 axis(0).crossProduct(axis(1)) / volume};
    TzGeMatrix3d back;
    for (int row = 0; row < 3; ++row) {
        for (int column = 0; column < 3; ++column)
            back.entry[row][column] = rows[row][column];
        back.entry[row][3] = -rows[row].dotProduct(origin().asVector());
    }
    return back;
}

double TzGeMatrix3d::det() const {
    return axis(0).dotProduct(axis(1).crossProduct(axis(2)));
}

bool TzGeMatrix3d::isSingular(TzGeTol const& tol) const {
    double const x = axis(0).length();
    double const y = axis(1).length();
    double const z = axis(2).length();
    if (x == 0.0 || y == 0.0 || z == 0.0) return true;
    double const volume = (axis(0) / x).dotProduct((axis(1) / y).crossProduct(axis(2) / z));
    return std::fabs(volume) <= tol.equalVector();
}

bool TzGeMatrix3d::isUniScaledOrtho(TzGeTol const& tol) const {
    double const size = scale();
    if (size == 0.0) return false;
    TzGeVector3d const unit[] = {axis(0) / size, axis(1) / size, axis(2) / size};
    for (int i = 0; i < 3; ++i) {
        if (std::fabs(unit[i].length() - 1.0) > tol.equalVector()) return false;
        if (!unit[i].isPerpendicularTo(unit[(i + 1) % 3], tol)) return false;
    }
    return true;
}

double TzGeMatrix3d::scale() const {
    return std::max({axis(0).length(), axis(1).length(), axis(2).length()});
}

bool TzGeMatrix3d::isEqualTo(TzGeMatrix3d const& other, TzGeTol const& tol) const {
    for (int i = 0; i < 3; ++i) {
        if (!axis(i).isEqualTo(other.axis(i), tol)) return false;
    }
    return origin().isEqualTo(other.origin(), tol);
}
