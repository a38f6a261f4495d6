#pragma once

#include <string>

#include "host/display/plot_scene.h"

// Paints a scene onto a white page, as large as the page's margins allow.
namespace tzhost {

enum class PlotFormat { svg, png, pdf };

// The bytes of the file: SVG and PNG of 1600 by 900 pixels, PDF of one A4 page lying on its side.
// Letters are outlines, so no viewer needs their fonts. Empty when Cairo fails, which takes a lack
// of memory. Shapes with a coordinate that is not finite are left out.
[[nodiscard]] std::string paintPlot(PlotScene const& scene, PlotFormat format);

}  // namespace tzhost
