#include <cmath>

#include "tz/ge/arbitrary_axis.h"
#include "tz/ge/line3d.h"
#include "tz/ge/plane.h"

TzGePlane::TzGePlane(TzGePoint3d const& point, TzGeVector3d const& normal) : origin_(point) {
    TzGeMatrix3d const axes = atwt(normal);
    xAxis_ = axes.xAxis();
    yAxis_ = axes.yAxis();
    normal_ = axes.zAxis();
}

TzGePlane::TzGePlane(TzGePoint3d const& origin,
                     TzGeVector3d const& xAxis,
                     TzGeVector3d const& yAxis)
    : origin_(origin) {
    if (xAxis.isZeroLength() || yAxis.isZeroLength() || xAxis.isParallelTo(yAxis)) return;
    xAxis_ = xAxis;
    yAxis_ = yAxis;
    normal_ = xAxis.normal().crossProduct(yAxis.normal()).normal();
}

void TzGePlane::getCoordSystem(TzGePoint3d& origin,
                               TzGeVector3d& xAxis,
                               TzGeVector3d& yAxis) const {
    origin = origin_;
    xAxis = xAxis_;
    yAxis = yAxis_;
}

bool TzGePlane::isOn(TzGePoint3d const& point, TzGeTol const& tol) const {
    return std::fabs(signedDistanceTo(point)) <= tol.equalPoint();
}

bool TzGePlane::intersectWith(TzGeLine3d const& line, TzGePoint3d& out, TzGeTol const& tol) const {
    TzGeVector3d const along = line.direction();
    if (along.isZeroLength(tol) || along.isPerpendicularTo(normal_, tol)) return false;
    out = line.pointOnLine().project(*this, along);
    return true;
}

TzGePlane& TzGePlane::transformBy(TzGeMatrix3d const& matrix) {
    TzGeVector3d const x = xAxis_.transformBy(matrix);
    TzGeVector3d const y = yAxis_.transformBy(matrix);
    origin_.transformBy(matrix);
    TzGeVector3d const across = x.normal().crossProduct(y.normal());
    if (!across.isZeroLength()) normal_ = across.normal();
    return *this;
}

TzGeVector3d tzgeArbitraryXAxis(TzGeVector3d const& normal) {
    if (normal.isZeroLength()) return TzGeVector3d::kXAxis;
    constexpr double kNearZ = 1.0 / 64.0;
    TzGeVector3d const n = normal.normal();
    bool const nearZ = std::fabs(n.x) < kNearZ && std::fabs(n.y) < kNearZ;
    return (nearZ ? TzGeVector3d::kYAxis : TzGeVector3d::kZAxis).crossProduct(n).normal();
}

TzGeMatrix3d atwt(TzGeVector3d const& normal) {
    TzGeVector3d const z = normal.isZeroLength() ? TzGeVector3d::kZAxis : normal.normal();
    TzGeVector3d const x = tzgeArbitraryXAxis(z);
    return TzGeMatrix3d().setCoordSystem(TzGePoint3d::kOrigin, x, z.crossProduct(x).normal(), z);
}
