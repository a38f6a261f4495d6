#include <algorithm>

#include "tz/ge/bound_block3d.h"

TzGeBoundBlock3d& TzGeBoundBlock3d::set(TzGePoint3d const& first, TzGePoint3d const& second) {
    TzGeVector3d const diagonal = second - first;
    return set(first, {diagonal.x, 0.0, 0.0}, {0.0, diagonal.y, 0.0}, {0.0, 0.0, diagonal.z});
}

TzGeBoundBlock3d& TzGeBoundBlock3d::set(TzGePoint3d const& base,
                                        TzGeVector3d const& side1,
                                        TzGeVector3d const& side2,
                                        TzGeVector3d const& side3) {
    base_ = base;
    sides_[0] = side1;
    sides_[1] = side2;
    sides_[2] = side3;
    empty_ = false;
    return *this;
}

void TzGeBoundBlock3d::get(TzGePoint3d& base,
                           TzGeVector3d& side1,
                           TzGeVector3d& side2,
                           TzGeVector3d& side3) const {
    base = base_;
    side1 = sides_[0];
    side2 = sides_[1];
    side3 = sides_[2];
}

void TzGeBoundBlock3d::getMinMaxPoints(TzGePoint3d& smallest, TzGePoint3d& largest) const {
    smallest = largest = base_;
    for (TzGeVector3d const& side : sides_) {
        for (int i = 0; i < 3; ++i) {
            smallest[i] += std::min(side[i], 0.0);
            largest[i] += std::max(side[i], 0.0);
        }
    }
}

bool TzGeBoundBlock3d::isBox(TzGeTol const& tol) const {
    TzGeVector3d const axes[] = {TzGeVector3d::kXAxis, TzGeVector3d::kYAxis, TzGeVector3d::kZAxis};
    for (int i = 0; i < 3; ++i) {
        if (!sides_[i].isZeroLength(tol) && !sides_[i].isParallelTo(axes[i], tol)) return false;
    }
    return true;
}

bool TzGeBoundBlock3d::contains(TzGePoint3d const& point, TzGeTol const& tol) const {
    if (empty_) return false;
    TzGePoint3d low;
    TzGePoint3d high;
    getMinMaxPoints(low, high);
    for (int i = 0; i < 3; ++i) {
        if (point[i] < low[i] - tol.equalPoint() || point[i] > high[i] + tol.equalPoint())
            return false;
    }
    return true;
}

TzGeBoundBlock3d& TzGeBoundBlock3d::extend(TzGePoint3d const& point) {
    if (empty_) return set(point, point);
    TzGePoint3d low;
    TzGePoint3d high;
    getMinMaxPoints(low, high);
    for (int i = 0; i < 3; ++i) {
        low[i] = std::min(low[i], point[i]);
        high[i] = std::max(high[i], point[i]);
    }
    return set(low, high);
}

TzGeBoundBlock3d& TzGeBoundBlock3d::extend(TzGeBoundBlock3d const& other) {
    if (other.empty_) return *this;
    TzGePoint3d low;
    TzGePoint3d high;
    other.getMinMaxPoints(low, high);
    return extend(low).extend(high);
}

TzGeBoundBlock3d& TzGeBoundBlock3d::transformBy(TzGeMatrix3d const& matrix) {
    if (empty_) return *this;
    base_.transformBy(matrix);
    for (TzGeVector3d& side : sides_)
        side.transformBy(matrix);
    return *this;
}
