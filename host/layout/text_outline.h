#pragma once

#include <array>
#include <vector>

#include "host/layout/layout_types.h"

// The letters of a run as outlines, for plots.
//
//   for (OutlineStep const& step : textOutline(run)) ... // cairo_move_to and its kin, then a fill
//
// Points are in the frame of the layout that the run came from. The outlines of a run are closed
// and are filled by the non-zero winding rule. Main thread only, as all shaping.
namespace tzhost {

enum class OutlineKind { move, line, curve, close };

// A move or a line uses the first point; a curve uses all: two controls and its end.
struct OutlineStep {
    OutlineKind kind = OutlineKind::move;
    std::array<LayoutPoint, 3> points;
};

[[nodiscard]] std::vector<OutlineStep> textOutline(GlyphRun const& run);

}  // namespace tzhost
