#pragma once

#include <functional>
#include <string_view>

#include "host/display/plot_scene.h"

// Paints a scene onto a white page, as large as the page's margins allow.
namespace tzhost {

enum class PlotFormat { svg, png, pdf };

// Takes a part of a file; false when it cannot.
using ByteTaker = std::function<bool(std::string_view bytes)>;

// Writes the file: SVG and PNG of 1600 by 900 pixels, PDF of one A4 page lying on its side.
// Letters are outlines, so no viewer needs their fonts; those too small for the page show as lines.
// False when a part was not taken or Cairo fails, which takes a lack of memory. Shapes with a
// coordinate that is not finite are left out.
[[nodiscard]] bool paintPlot(PlotScene const& scene, PlotFormat format, ByteTaker const& take);

}  // namespace tzhost
