#pragma once

#include <optional>
#include <vector>

#include "host/display/draw_list.h"
#include "host/display/view.h"
#include "host/layout/text_outline.h"

// A drawing list turned into flat shapes in the colours of a page: all that remains is to scale and
// paint them. Coordinates are those of the view, in drawing units, y up.
namespace tzhost {

// Components from 0 to 1.
struct PlotColor {
    double red = 0.0;
    double green = 0.0;
    double blue = 0.0;
    double alpha = 1.0;
};

enum class PlotKind { stroke, fill };

struct PlotShape {
    PlotKind kind = PlotKind::stroke;
    std::vector<OutlineStep> path;
    PlotColor color;
    double lineWeight = 0.0;     // millimetres on the page; 0 draws the thinnest line
    std::vector<double> dashes;  // drawing units, dash and gap in turn; empty is solid
};

struct PlotScene {
    std::vector<PlotShape> shapes;

    // The box around all shapes; nothing for a scene without any, or with none that is finite.
    [[nodiscard]] std::optional<LayoutBox> extents() const;
};

[[nodiscard]] PlotScene makeScene(DrawList const& list, ViewAxes const& axes);

}  // namespace tzhost
