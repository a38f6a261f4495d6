#pragma once

#include "module/align/spacing/aligned_entity.h"
#include "tz/ge/point2d.h"

// Texts for an alignment that need no drawing: their boxes are given.
namespace tztest {

// A working system with these axes.
[[nodiscard]] inline TzGeMatrix3d
placed(TzGePoint3d const& origin, TzGeVector3d const& x, TzGeVector3d const& y) {
    TzGeMatrix3d system;
    system.setCoordSystem(origin, x, y, x.crossProduct(y));
    return system;
}

// A box in world coordinates.
class GivenMaker final : public TzMTextAlignBoundBoxMaker {
public:
    GivenMaker(TzDbObjectId const& id, TzGeMatrix3d const& system, TzGeBoundBlock3d const& box)
        : TzMTextAlignBoundBoxMaker(id, system), box_(box) {}
    [[nodiscard]] Box makeWcsBoundBox() const override { return box_; }

private:
    TzGeBoundBlock3d box_;
};

// A text with a box given in coordinates of the working plane.
class GivenText : public TzMTextAlignManipulatorEntity {
public:
    GivenText(TzGePoint2d const& low, TzGePoint2d const& high, TzGeMatrix3d const& system = {})
        : TzMTextAlignManipulatorEntity({}, system),
          box_(TzGePoint3d(low.x, low.y, 0), {high.x, high.y, 0}) {
        box_.transformBy(system);
    }

protected:
    [[nodiscard]] BoundBoxMakerHolder boundBoxMaker() const override {
        return BoundBoxMakerHolder(new GivenMaker(m_id, m_coordSystem, box_));
    }

private:
    TzGeBoundBlock3d box_;
};

}  // namespace tztest
