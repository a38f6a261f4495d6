#include <algorithm>
#include <cmath>
#include <limits>

#include "tz/ge/line3d.h"
#include "tz/ge/line_seg3d.h"

namespace {

TzGeVector3d unitOrZero(TzGeVector3d const& v) {
    return v.isZeroLength() ? TzGeVector3d::kIdentity : v.normal();
}

// How far apart two lines that cross may seem to be, only because the coordinates of points this
// large are rounded.
double roundingOf(TzGePoint3d const& a, TzGePoint3d const& b) {
    double largest = 0.0;
    for (int i = 0; i < 3; ++i)
        largest = std::max({largest, std::fabs(a[i]), std::fabs(b[i])});
    return 16.0 * std::numeric_limits<double>::epsilon() * largest;
}

}  // namespace

TzGeLine3d::TzGeLine3d(TzGePoint3d const& point, TzGeVector3d const& direction)
    : point_(point), direction_(unitOrZero(direction)) {}

TzGeLine3d::TzGeLine3d(TzGePoint3d const& first, TzGePoint3d const& second)
    : TzGeLine3d(first, second - first) {}

TzGePoint3d TzGeLine3d::getClosestPointTo(TzGePoint3d const& point, TzGeTol const& tol) const {
    TzGePoint3d const foot = evalPoint(paramOf(point));
    return foot.isEqualTo(point, tol) ? point : foot;
}

bool TzGeLine3d::intersectWith(TzGeLine3d const& other,
                               TzGePoint3d& out,
                               TzGeTol const& tol) const {
    if (direction_.isZeroLength(tol) || other.direction_.isZeroLength(tol)) return false;
    if (direction_.isParallelTo(other.direction_, tol)) return false;
    TzGeVector3d const across = direction_.crossProduct(other.direction_);
    TzGeVector3d const between = other.point_ - point_;
    double const gap = std::fabs(between.dotProduct(across)) / across.length();
    if (gap > tol.equalPoint() + roundingOf(point_, other.point_)) return false;
    double const param =
        between.crossProduct(other.direction_).dotProduct(across) / across.dotProduct(across);
    out = evalPoint(param);
    return true;
}

TzGeLine3d& TzGeLine3d::transformBy(TzGeMatrix3d const& matrix) {
    point_.transformBy(matrix);
    direction_ = unitOrZero(direction_.transformBy(matrix));
    return *this;
}

TzGeLineSeg3d& TzGeLineSeg3d::transformBy(TzGeMatrix3d const& matrix) {
    start_.transformBy(matrix);
    end_.transformBy(matrix);
    return *this;
}
