#include "tz/ge/matrix3d.h"
#include "tz/ge/plane.h"
#include "tz/ge/point3d.h"

TzGePoint3d&
TzGePoint3d::rotateBy(double angle, TzGeVector3d const& axis, TzGePoint3d const& centre) {
    return *this = centre + (*this - centre).rotateBy(angle, axis);
}

TzGePoint3d& TzGePoint3d::transformBy(TzGeMatrix3d const& matrix) {
    return *this = matrix.origin() + asVector().transformBy(matrix);
}

TzGePoint3d TzGePoint3d::orthoProject(TzGePlane const& plane) const {
    return *this - plane.normal() * plane.signedDistanceTo(*this);
}

TzGePoint3d TzGePoint3d::project(TzGePlane const& plane, TzGeVector3d const& direction) const {
    TzGeVector3d const normal = plane.normal();
    if (direction.isZeroLength() || direction.isPerpendicularTo(normal)) return *this;
    return *this - direction * (plane.signedDistanceTo(*this) / direction.dotProduct(normal));
}
