#pragma once

#include "module/align/manipulator.h"
#include "tz/ed/jig.h"

// Shows the alignment while the second point of its line is dragged.
//
//   TzMTextAlignJig jig(manipulator);
//   jig.preparePrompt();
//   if (jig.drag() == TzEdJig::kNormal) manipulator.updateDb();
//
// One jig serves a run: its last point lasts from drag to drag, so that a cursor which has not
// moved since changes nothing, not even after another spacing was chosen.
class TzMTextAlignJig : public TzEdJig {
public:
    // The manipulator outlives the jig.
    explicit TzMTextAlignJig(TzMTextAlignManipulator& manipulator);

    // Before each drag.
    void preparePrompt();

    DragStatus sampler() override;
    bool update() override;
    [[nodiscard]] TzDbEntity* entity() const override;

private:
    void prepareForKeywords();
    void initForSampler();

    TzMTextAlignManipulator& m_manipulator;
    TzString m_keywords;
    TzString m_prompt;
    bool m_hasLastPoint = false;
    TzGePoint3d m_lastPoint;
};
