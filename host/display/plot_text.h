#pragma once

#include <cairo.h>

#include <cstddef>
#include <map>
#include <set>
#include <string>

#include "host/display/plot_glyphs.h"

// Letters as text: glyphs of fonts that the document holds, with the characters that they stand
// for, so that a reader finds and copies them.
//
//   TextPainter text(cairo, sheet, lockedFaces);
//   text.show(letters);      // in the colour that is set
//
// What no text can show is filled as outlines: glyphs that a font lacks, letters seen from their
// edge, and faces that may not be embedded, whose names are noted.
namespace tzhost {

// Adds a path of page coordinates to a canvas that had none.
void addPath(cairo_t* cairo, std::vector<OutlineStep> const& path);

class TextPainter {
public:
    TextPainter(cairo_t* cairo, PlotSheet const& sheet, std::set<std::string>& lockedFaces)
        : cairo_(cairo), sheet_(sheet), lockedFaces_(lockedFaces) {}

    void show(PlotShape const& letters);

private:
    [[nodiscard]] bool showAsText(AlikeGlyphs const& glyphs);
    void showWord(AlikeGlyphs const& word);
    void fillOutlines(AlikeGlyphs const& glyphs);
    [[nodiscard]] bool canBeText(PlotGlyph const& glyph);
    // From Pango units to the page, without the glyph's place.
    [[nodiscard]] cairo_matrix_t matrixOf(PlotGlyph const& glyph) const;

    cairo_t* cairo_;
    PlotSheet const& sheet_;
    std::set<std::string>& lockedFaces_;
    std::map<GlyphFont, bool> usable_;
    std::size_t words_ = 0;  // shown so far
};

}  // namespace tzhost
