#pragma once

#include <vector>

#include "host/layout/layout_types.h"
#include "tz/ge/point3d.h"
#include "tz/ge/vector3d.h"
#include "tz/gi/draw.h"

// Draws laid out text: what all texts share.
namespace tzhost {

// A layout's own frame in the world; all axes are unit vectors.
struct TextFrame {
    TzGePoint3d origin;
    TzGeVector3d direction;
    TzGeVector3d normal;

    [[nodiscard]] TzGePoint3d at(LayoutPoint const& point) const;
};

// Draws letters and rules; what has the entity's colour is drawn with the traits as they stand.
void drawRuns(TzGiWorldDraw& draw, TextFrame const& frame, std::vector<GlyphRun> const& runs);
void drawRules(TzGiWorldDraw& draw, TextFrame const& frame, std::vector<TextRule> const& rules);

}  // namespace tzhost
