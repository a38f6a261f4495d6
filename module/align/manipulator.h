#pragma once

#include <vector>

#include "module/align/spacing/aligned_entity.h"
#include "module/align/spacing/options_factory.h"
#include "tz/ge/line_seg3d.h"
#include "tz/ge/plane.h"
#include "tz/text/array.h"

class TzRxClass;

// One run of an alignment: which of the selected texts take part and on which plane, the two points
// of the line, the justification and the spacing. It is the entity that the drag draws, and never
// enters a drawing.
//
//   manipulator.registerAlignOption(new TzMTextAlignOptionDistribute);   // and so on
//   manipulator.loadDefaultSettings();
//   manipulator.insertTexts(selection);
//   manipulator.addText();
//   manipulator.setFirstPoint(first);      // or setTargetText(id)
//   manipulator.prepareForDragging();
//   manipulator.setSecondPoint(second);    // these two for each place of the cursor
//   manipulator.alignEntities();
//   manipulator.updateDb();                // the first to change the drawing
//   manipulator.saveAsDefaultSettings();
//
// Points are world coordinates. One run at a time.
class TzMTextAlignManipulator : public TzDbEntity {
public:
    TzMTextAlignManipulator();
    ~TzMTextAlignManipulator() override;

    // Takes those texts of a selection that lie in the plane of most of them; when several planes
    // have the same number of texts, the plane that reached this number first. False when the
    // selection holds nothing.
    bool insertTexts(long long const* selection);
    [[nodiscard]] TzArray<TzDbObjectId> const& texts() const { return m_texts; }
    // Makes the entities that are dragged, one for each text taken.
    void addText();

    // The line then starts at this text, whatever the first point; it need not be one of those that
    // are aligned, nor lie on their plane.
    void setTargetText(TzDbObjectId id);
    // Off the working plane it is brought there along the plane's normal.
    void setFirstPoint(TzGePoint3d const& point);
    // Off the working plane it is brought there along the view, or along the plane's normal when
    // the plane is seen from its edge.
    void setSecondPoint(TzGePoint3d const& point);
    void setAlignDirection(tagTextDirection direction) { m_direction = direction; }
    [[nodiscard]] tagTextDirection alignDirection() const { return m_direction; }
    // Kept and not used: the gap in force is the option's. Nothing calls it.
    void setAlignSpacingValue(double value) { m_spacingValue = value; }

    // Makes the option of that name the one in force and lets it ask what it needs, and returns the
    // outcome of that question. An unknown name changes nothing.
    bool setAlignOption(TzString const& name);
    // Takes the option over.
    void registerAlignOption(TzMTextAlignOption* option);
    // Null before the settings are loaded.
    [[nodiscard]] TzMTextAlignOption* alignOption() const { return m_option; }

    // Where the line starts: the target text's point when there is one. Valid until the next call.
    [[nodiscard]] TzGePoint3d const& firstPoint() const;
    [[nodiscard]] TzGePlane workingPlane() const;
    // Maps the working plane to the world.
    [[nodiscard]] TzGeMatrix3d const& coorSystemForWorkingPlane() const {
        return m_workingCoordSystem;
    }
    // From the first point to the second.
    [[nodiscard]] TzGeLineSeg3d alignmentBaseline() const;

    void prepareForDragging();
    // Moves the copies of the texts to the line; without a length they stay where they are.
    void alignEntities();
    // Moves the texts to where their copies are, or says why none is moved.
    void updateDb();

    // TEXTALIGNMODE, TEXTALIGNSPACING, and what the option keeps.
    void loadDefaultSettings();
    void saveAsDefaultSettings();

    // Texts, multi-line texts and attribute definitions; derived classes are not.
    [[nodiscard]] bool isTextSupported(TzDbObjectId id) const;
    // Adds a class to these. Nothing calls it.
    void addSupportedEntityType(TzRxClass* kind);

protected:
    bool subWorldDraw(TzGiWorldDraw* draw) override;
    void subViewportDraw(TzGiViewportDraw* draw) override;

private:
    void insertMajority(TzArray<TzDbObjectId> const& ids);
    void setWorkingPlane();
    [[nodiscard]] bool hasLine() const;
    [[nodiscard]] TzGePoint3d projectToWorkplaneAlongViewDir(TzGePoint3d const& point) const;

    TzArray<TzDbObjectId> m_texts;
    TzGePoint3d m_firstPoint;
    std::vector<TzMTextAlignManipulatorEntity*> m_entities;  // owned, in the order of m_texts
    TzMTextAlignOptionsFactory m_optionsFactory;
    tagTextDirection m_direction = tagTextDirection::Left;
    double m_spacingValue = 0;
    TzMTextAlignOption* m_option = nullptr;                      // one of the factory's
    TzMTextAlignManipulatorEntity* m_referenceEntity = nullptr;  // owned, the target text
    TzGePoint3d m_secondPoint;
    TzGeMatrix3d m_workingCoordSystem;
    TzArray<TzRxClass*> m_supportedTypes;
};
