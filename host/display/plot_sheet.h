#pragma once

#include <optional>
#include <vector>

#include "host/display/plot_scene.h"
#include "host/page/page.h"

// A scene with its place on a page. A plot on no paper fills a page of a fixed size, one on paper
// lies as its page says.
namespace tzhost {

enum class PlotFormat { svg, png, pdf };

// A page unit is a pixel of PNG, a point of PDF, and 1/96 inch of SVG. Coordinates on the page run
// to the right and down.
struct PlotSheet {
    PlotScene scene;
    double width = 0.0;              // page units
    double height = 0.0;             // page units
    double perMillimetre = 1.0;      // page units
    double thinnestLine = 1.0;       // page units
    LayoutPoint middle;              // the point of the view that lies in the page's middle
    double scale = 1.0;              // page units for a unit of the view
    std::optional<LayoutBox> shown;  // of the view; nothing when all of it shows
    bool isPaper = false;            // the page has a size in millimetres

    // From the view to the page.
    [[nodiscard]] LayoutPoint place(LayoutPoint const& point) const {
        return {width / 2.0 + (point.x - middle.x) * scale,
                height / 2.0 - (point.y - middle.y) * scale};
    }
    // What may be drawn on, on the page: a thinnest line on the edge of what is shown shows whole.
    [[nodiscard]] std::optional<LayoutBox> clip() const;
};

// A path on the page; nothing for one with a coordinate that is not finite.
[[nodiscard]] std::optional<std::vector<OutlineStep>>
placedPath(PlotSheet const& sheet, std::vector<OutlineStep> const& path);

// Whether a shape is letters that can stand on the page as text. Letters that would vanish in its
// grid show as a line; of those larger than the page no more than a part of their outline shows.
[[nodiscard]] bool isText(PlotSheet const& sheet, PlotShape const& shape);
[[nodiscard]] bool isTooSmall(PlotSheet const& sheet, PlotShape const& shape);
[[nodiscard]] std::vector<OutlineStep> baselineOf(PlotShape const& letters);

// How a line is drawn, in page units. Dashes that run into each other, or longer than anything,
// show as a solid line, which has none.
struct StrokeLook {
    double width = 0.0;
    std::vector<double> dashes;

    // Where in the dashes a line goes on that was so long before.
    [[nodiscard]] double offsetAfter(double before) const;
};
[[nodiscard]] StrokeLook strokeOf(PlotSheet const& sheet, PlotShape const& shape);

// The page with room around it: what lies further off leaves no trace on the page.
[[nodiscard]] inline LayoutBox surroundingsOf(PlotSheet const& sheet) {
    return {-sheet.width, -sheet.height, 2.0 * sheet.width, 2.0 * sheet.height};
}

// Fitted to a page of 1600 by 900 pixels, or to one A4 page lying on its side.
[[nodiscard]] PlotSheet fittedSheet(PlotScene scene, PlotFormat format);

// On a page that problemOf finds nothing wrong with. `window` is the page's window in the view.
// `dotsPerInch` are those of a PNG.
[[nodiscard]] PlotSheet paperSheet(PlotScene scene,
                                   PlotFormat format,
                                   Page const& page,
                                   std::optional<PageBox> const& window,
                                   double dotsPerInch);

}  // namespace tzhost
