#pragma once

#include <functional>
#include <set>
#include <string>
#include <string_view>
#include <vector>

#include "host/display/plot_sheet.h"

// Paints scenes onto white pages.
namespace tzhost {

// Takes a part of a file; false when it cannot.
using ByteTaker = std::function<bool(std::string_view bytes)>;

// Writes the file, a page for each sheet; SVG and PNG have one alone. Letters are outlines, but for
// those of a PDF, which holds their fonts; so no viewer needs fonts. Faces that may not lie in a
// document are added to `lockedFaces`, and their letters are outlines there too. Letters too small
// for the page show as lines. False when a part was not taken or Cairo fails, which takes a lack of
// memory. Shapes with a coordinate that is not finite are left out.
[[nodiscard]] bool paintPlot(std::vector<PlotSheet> const& sheets,
                             PlotFormat format,
                             ByteTaker const& take,
                             std::set<std::string>& lockedFaces);

}  // namespace tzhost
