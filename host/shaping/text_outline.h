#pragma once

#include <array>
#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "host/shaping/glyph_types.h"

struct _PangoFont;

// The letters of a run as outlines and as glyphs of their fonts, for plots.
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

    // How many of the points count.
    [[nodiscard]] std::size_t pointCount() const;
};

// The font that a glyph is from; Pango's.
using GlyphFont = std::shared_ptr<_PangoFont>;

// One glyph, with the part of the baseline that it takes. Blanks have no steps.
struct OutlinedLetter {
    std::vector<OutlineStep> steps;
    LayoutPoint start;
    LayoutPoint end;
    GlyphFont font;          // null when there is none at all
    unsigned int glyph = 0;  // its number in the font; Pango's special ones for what a font lacks
    LayoutPoint origin;      // where the glyph's own origin lies
    LayoutPoint along;  // what a step of one Pango unit to the right adds, at the reference size
    LayoutPoint down;   // the same downwards
    // The characters that this glyph and those after it stand for, in UTF-8; empty for a glyph that
    // belongs to the one before it.
    std::string text;
    std::size_t at = 0;        // where in the run's UTF-8 they stand
    bool rightToLeft = false;  // the letters are read from the last to the first
    bool spread = false;       // they stand further apart or closer together than the font says
};
using LetterTaker = std::function<void(OutlinedLetter const& letter)>;

// Hands over the letters one by one, from left to right, so that a long run takes little memory.
void outlineLetters(GlyphRun const& run, LetterTaker const& take);

// The outline of a glyph at the reference size, in Pango units, y down from its own origin. Valid
// until the next call.
[[nodiscard]] std::vector<OutlineStep> const& outlineOf(GlyphFont const& font, unsigned int glyph);

}  // namespace tzhost
