#pragma once

#include "module/align/spacing/spacing_option.h"

// One pass of an alignment: puts the texts in order along the line, asks the spacing option for
// their moves, and moves their copies. Built for each place of the cursor; no object of the drawing
// is touched.
//
//   TzMTextAlignManipulatorGut pass(entities, reference, option, baseline, workingSystem);
//   pass.alignEntities();
class TzMTextAlignManipulatorGut {
public:
    // `referenceEntity` may be null. The entities and the option are borrowed. The baseline runs
    // from the first point to the second, world coordinates.
    TzMTextAlignManipulatorGut(TzMTextAlignOption::Entities const& entities,
                               TzMTextAlignManipulatorEntity* referenceEntity,
                               TzMTextAlignOption* option,
                               TzGeLineSeg3d const& baseline,
                               TzGeMatrix3d const& coordSystem);

    // The reference text comes first, wherever it stands, and is left out as one of the others.
    void alignEntities();
    // Puts the indices in the order in which the texts' reference points lie along the line; texts
    // before the first point come first, and texts at the same place keep their order.
    void sortEntities(TzMTextAlignOption::Entities const& entities);
    [[nodiscard]] TzMTextAlignOption::Indices const& sortedIndices() const {
        return m_sortedIndices;
    }

private:
    void align(TzMTextAlignOption::Entities const& entities);

    TzMTextAlignOption::Entities const& m_entities;
    TzMTextAlignManipulatorEntity* m_referenceEntity;
    TzMTextAlignOption* m_option;
    TzGeMatrix3d m_coordSystem;
    TzGeLineSeg3d m_baseline;
    TzMTextAlignOption::Indices m_sortedIndices;
};
