#pragma once

#include <memory>
#include <optional>

#include "tz/db/object_id.h"
#include "tz/ge/bound_block3d.h"
#include "tz/ge/matrix3d.h"

// Makes the flat box of a text on the working plane: from the text's own frame, which may be
// turned, to a box along the axes of the plane. A derived class measures its kind of text.
//
//   TzMTextAlignBoundBoxMakerText maker(id, workingSystem);
//   auto const box = maker.makeBoundBox();    // in coordinates of the working plane
//
// Id and system are borrowed. Makers are freed by BoundBoxMakerRelease, never through a pointer to
// this class: its only virtual operation is the measuring.
class TzMTextAlignBoundBoxMaker {
public:
    TzMTextAlignBoundBoxMaker(TzDbObjectId const& id, TzGeMatrix3d const& coordSystem)
        : m_id(id), m_coordSystem(coordSystem) {}

    // A box, which is empty when the text cannot be measured; nothing when it cannot be opened.
    using Box = std::optional<TzGeBoundBlock3d>;

    // The box in world coordinates, as a base and sides.
    [[nodiscard]] virtual Box makeWcsBoundBox() const = 0;

    // A text off the working plane is then laid on it along this direction. A zero vector turns
    // that off, as it is at first.
    void setViewDirectionForProjection(TzGeVector3d const& direction);

    // The box on the working plane, between its upper left and its lower right corner; z is 0. An
    // empty one reads as the plane's origin.
    [[nodiscard]] Box makeBoundBox() const;

protected:
    ~TzMTextAlignBoundBoxMaker() = default;

    [[nodiscard]] TzDbObjectId const& id() const { return m_id; }

private:
    // A base and three sides, world or working coordinates.
    struct Block {
        TzGePoint3d base;
        TzGeVector3d sides[3];
    };
    // Two numbers of sides.
    struct FlatSides {
        int first;
        int second;
    };

    [[nodiscard]] Box makeWcsBoundBoxOnWorkingPlane() const;
    [[nodiscard]] bool isOnTheWorkingPlane(TzGeBoundBlock3d const& box) const;
    void projection(TzGeBoundBlock3d& box) const;
    void adjustBoundingBoxOnTheWorkingPlane(TzGeBoundBlock3d& box) const;
    void transformIntoWokingCoordSystem(Block& block) const;
    [[nodiscard]] static Block blockOf(TzGeBoundBlock3d const& box);
    [[nodiscard]] static FlatSides flatSidesOf(Block const& block);
    [[nodiscard]] static TzGeBoundBlock3d makeBoundingBoxOnTheWorkingPlane(Block const& block,
                                                                           FlatSides flat);

    TzDbObjectId const& m_id;
    TzGeMatrix3d const& m_coordSystem;
    bool m_projectOnPlane = false;
    TzGeVector3d m_viewDirection;
};

// A maker holds only borrowed and plain values, so freeing its memory is enough.
struct BoundBoxMakerRelease {
    void operator()(TzMTextAlignBoundBoxMaker* maker) const {
        ::operator delete(static_cast<void*>(maker));
    }
};
using BoundBoxMakerHolder = std::unique_ptr<TzMTextAlignBoundBoxMaker, BoundBoxMakerRelease>;
