#pragma once

#include <vector>

#include "host/display/plot_scene.h"

// What a pen means on paper. The page is white, so index 7 and true white draw black; an area
// filled with them stays white, else it would hide the letters on it.
namespace tzhost {

[[nodiscard]] PlotColor inkOf(DrawPen const& pen, PlotKind kind);
// Millimetres; standard weights below 0 give the thinnest line.
[[nodiscard]] double lineWeightOf(DrawPen const& pen);
// The dashes of the pen's line type as a plot shape holds them.
[[nodiscard]] std::vector<double> dashesOf(DrawPen const& pen);

}  // namespace tzhost
