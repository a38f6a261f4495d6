#pragma once

#include <functional>
#include <optional>
#include <string>
#include <vector>

#include "host/display/draw_list.h"
#include "host/display/view_axes.h"
#include "host/layout/layout_types.h"
#include "host/shaping/text_outline.h"

// A drawing list as flat shapes in the colours of a page: all that remains is to scale and paint
// them. Coordinates are those of the view, in drawing units, y up. The shapes are made each time
// they are asked for and not kept, since letters as outlines take much room.
namespace tzhost {

// Components from 0 to 1.
struct PlotColor {
    double red = 0.0;
    double green = 0.0;
    double blue = 0.0;
    double alpha = 1.0;
};

enum class PlotKind { stroke, fill };

// A glyph of letters: what an OutlinedLetter says, in the view.
struct PlotGlyph {
    GlyphFont font;
    unsigned int glyph = 0;
    LayoutPoint origin;
    LayoutPoint along;
    LayoutPoint down;
    std::string text;
    std::size_t at = 0;  // the place of `text` among the characters of the letters
    bool rightToLeft = false;
    bool spread = false;
};

struct PlotShape {
    PlotKind kind = PlotKind::stroke;
    std::vector<OutlineStep> path;
    PlotColor color;
    double lineWeight = 0.0;     // millimetres on the page; 0 draws the thinnest line
    std::vector<double> dashes;  // drawing units, dash and gap in turn; empty is solid
    double letterHeight = 0.0;   // of letters; 0 for other shapes
    LayoutPoint from;            // the baseline of letters
    LayoutPoint to;
    std::vector<PlotGlyph> glyphs;  // the letters that the path shows, from left to right
};

// Hands over the shapes from the lowest to the topmost, the same ones at each call.
using ShapeTaker = std::function<void(PlotShape const& shape)>;
using PlotScene = std::function<void(ShapeTaker const& take)>;

[[nodiscard]] PlotScene makeScene(DrawList list, ViewAxes const& axes);

// The box around all shapes; nothing for a scene without any, or with none that is finite.
[[nodiscard]] std::optional<LayoutBox> extentsOf(PlotScene const& scene);

}  // namespace tzhost
