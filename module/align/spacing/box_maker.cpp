#include "module/align/spacing/box_maker.h"

#include <algorithm>

#include "tz/ge/plane.h"

namespace {

constexpr int kThirdSide = 2;

// The side that leads off the plane: the first one that is zero or runs along the Z axis, else the
// third. The third too when more than one is zero.
int findZAxisIndex(TzGeVector3d const (&sides)[3]) {
    auto const isZero = [](TzGeVector3d const& side) { return side.isZeroLength(); };
    if (std::count_if(std::begin(sides), std::end(sides), isZero) > 1) return kThirdSide;
    for (int index = 0; index < kThirdSide; ++index)
        if (isZero(sides[index]) || sides[index].isParallelTo(TzGeVector3d::kZAxis)) return index;
    return kThirdSide;
}

}  // namespace

void TzMTextAlignBoundBoxMaker::setViewDirectionForProjection(TzGeVector3d const& direction) {
    m_viewDirection = direction;
    m_projectOnPlane = !direction.isZeroLength();
}

TzMTextAlignBoundBoxMaker::Box TzMTextAlignBoundBoxMaker::makeBoundBox() const {
    Box box = m_projectOnPlane ? makeWcsBoundBoxOnWorkingPlane() : makeWcsBoundBox();
    if (box && !box->isEmpty()) adjustBoundingBoxOnTheWorkingPlane(*box);
    return box;
}

TzMTextAlignBoundBoxMaker::Box TzMTextAlignBoundBoxMaker::makeWcsBoundBoxOnWorkingPlane() const {
    Box box = makeWcsBoundBox();
    if (box && !box->isEmpty() && !isOnTheWorkingPlane(*box)) projection(*box);
    return box;
}

TzMTextAlignBoundBoxMaker::Block TzMTextAlignBoundBoxMaker::blockOf(TzGeBoundBlock3d const& box) {
    Block block;
    box.get(block.base, block.sides[0], block.sides[1], block.sides[2]);
    return block;
}

void TzMTextAlignBoundBoxMaker::transformIntoWokingCoordSystem(Block& block) const {
    TzGeMatrix3d const toPlane = m_coordSystem.inverse();
    block.base.transformBy(toPlane);
    for (TzGeVector3d& side : block.sides)
        side.transformBy(toPlane);
}

TzMTextAlignBoundBoxMaker::FlatSides TzMTextAlignBoundBoxMaker::flatSidesOf(Block const& block) {
    switch (findZAxisIndex(block.sides)) {
    case 0: return {1, 2};
    case 1: return {0, 2};
    default: return {0, 1};
    }
}

// Only the first of the two flat sides is looked at: a tilt about it goes unnoticed.
bool TzMTextAlignBoundBoxMaker::isOnTheWorkingPlane(TzGeBoundBlock3d const& box) const {
    Block block = blockOf(box);
    transformIntoWokingCoordSystem(block);
    bool const isAtOrigin = block.base == TzGePoint3d::kOrigin;
    if (!isAtOrigin && !block.base.asVector().isPerpendicularTo(TzGeVector3d::kZAxis)) return false;
    TzGeVector3d const& side = block.sides[flatSidesOf(block).first];
    return side.isZeroLength() || side.isPerpendicularTo(TzGeVector3d::kZAxis);
}

void TzMTextAlignBoundBoxMaker::projection(TzGeBoundBlock3d& box) const {
    TzGeVector3d const normal = m_coordSystem.zAxis();
    TzGeVector3d const along = m_viewDirection.isPerpendicularTo(normal) ? normal : m_viewDirection;
    TzGePlane const plane(m_coordSystem.origin(), normal);
    box.transformBy(TzGeMatrix3d::projection(plane, along));
}

void TzMTextAlignBoundBoxMaker::adjustBoundingBoxOnTheWorkingPlane(TzGeBoundBlock3d& box) const {
    Block block = blockOf(box);
    transformIntoWokingCoordSystem(block);
    box = makeBoundingBoxOnTheWorkingPlane(block, flatSidesOf(block));
}

TzGeBoundBlock3d TzMTextAlignBoundBoxMaker::makeBoundingBoxOnTheWorkingPlane(Block const& block,
                                                                             FlatSides flat) {
    TzGeVector3d const& across = block.sides[flat.first];
    TzGeVector3d const& up = block.sides[flat.second];
    TzGePoint3d const corners[] = {block.base, block.base + across, block.base + up,
                                   block.base + across + up};
    TzGePoint3d low = block.base;
    TzGePoint3d high = block.base;
    for (TzGePoint3d const& corner : corners) {
        low.set(std::min(low.x, corner.x), std::min(low.y, corner.y), 0);
        high.set(std::max(high.x, corner.x), std::max(high.y, corner.y), 0);
    }
    return {TzGePoint3d(low.x, high.y, 0), TzGePoint3d(high.x, low.y, 0)};
}
