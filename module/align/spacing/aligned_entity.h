#pragma once

#include "module/align/spacing/box_maker.h"
#include "module/align/spacing/text_direction.h"
#include "tz/db/entity.h"

class TzGiCommonDraw;

// One text of an alignment. A copy of it is moved and drawn while the line is dragged; the text
// itself is moved once, at the end.
//
//   TzMTextAlignManipulatorEntity entity(id, workingSystem);
//   entity.prepareForDragging(tagTextDirection::BL);
//   entity.move(offset);          // as often as the cursor moves
//   entity.replaceDbEntity();
//
// A text that cannot be opened or measured has no copy: it draws nothing and stays where it is.
class TzMTextAlignManipulatorEntity : public TzDbEntity {
public:
    TzMTextAlignManipulatorEntity(TzDbObjectId id, TzGeMatrix3d const& coordSystem);
    ~TzMTextAlignManipulatorEntity() override;

    // Copies and measures the text, and takes the point of its box that goes to the line. A copy
    // that is there already stays, moved as it is.
    virtual void prepareForDragging(tagTextDirection direction);

    [[nodiscard]] TzDbObjectId id() const { return m_id; }
    // Where the text stood at first, in coordinates of the working plane, whatever was moved since.
    // The box's first corner is the upper left one.
    [[nodiscard]] TzGeBoundBlock3d const& boundingBox() const { return m_boundingBox; }
    [[nodiscard]] TzGePoint3d const& referencePoint() const { return m_referencePoint; }

    // Moves the copy to an offset, world coordinates, from where the text stood at first. An offset
    // that the host refuses, as it is not finite, leaves the copy at the one before.
    void move(TzGeVector3d const& offset);
    // Moves the text by the offset of its copy. One that cannot be opened stays as it is.
    void replaceDbEntity();

protected:
    unsigned int subSetAttributes(TzGiDrawableTraits* traits) override;
    bool subWorldDraw(TzGiWorldDraw* draw) override;
    void subViewportDraw(TzGiViewportDraw* draw) override;
    // A new maker for the box of this text.
    [[nodiscard]] virtual BoundBoxMakerHolder boundBoxMaker() const;

private:
    void cloneDbEntity();
    void calculateOriginalBoundingBoxInEcs();
    void calculateReferencePointInEcs(tagTextDirection direction);
    void updateAttributes(TzGiCommonDraw& draw);

protected:
    TzDbObjectId m_id;
    TzGeMatrix3d m_coordSystem;  // working plane to world

private:
    TzDbEntity* m_clone = nullptr;  // owned, in no database
    TzGeBoundBlock3d m_boundingBox;
    TzGePoint3d m_referencePoint;
    TzGeVector3d m_currentOffset;  // of the copy, world coordinates
    bool m_drawnInWorld = false;   // the copy left nothing for single views
};

// The text that the others are aligned to. It may lie off the working plane, and is then taken
// where it stands above or below it.
class TzMTextAlignManipulatorReferenceEntity : public TzMTextAlignManipulatorEntity {
public:
    using TzMTextAlignManipulatorEntity::TzMTextAlignManipulatorEntity;

protected:
    [[nodiscard]] BoundBoxMakerHolder boundBoxMaker() const override;
};
