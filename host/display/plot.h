#pragma once

#include <optional>
#include <string>

#include "host/display/plot_paint.h"

class TzDbDatabase;

// Plots of the drawing.
//
//   if (auto const fault = tzhost::plotDrawing(*database, PlotFormat::svg, "plan.svg"))
//   say(*fault);
namespace tzhost {

// Plots the active space as it is looked at, fitted to its extents, and writes it whole: a file
// that is there stays as it was until the new one is complete. Nothing on success, else one line
// that says what went wrong with which file, without an end.
[[nodiscard]] std::optional<std::string>
plotDrawing(TzDbDatabase& database, PlotFormat format, std::string const& file);

}  // namespace tzhost
