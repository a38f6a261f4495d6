#pragma once

#include <array>
#include <functional>
#include <vector>

#include "host/shaping/glyph_types.h"

// The letters of a run as outlines, for plots.
//
//   outlineLetters(run, [&](OutlinedLetter const& letter) { ... letter.steps ... });
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

// One letter, with the part of the baseline that it takes. Blanks have no steps.
struct OutlinedLetter {
    std::vector<OutlineStep> steps;
    LayoutPoint start;
    LayoutPoint end;
};
using LetterTaker = std::function<void(OutlinedLetter const& letter)>;

// Hands over the letters one by one, from left to right, so that a long run takes little memory.
void outlineLetters(GlyphRun const& run, LetterTaker const& take);

}  // namespace tzhost
