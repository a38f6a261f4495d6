#pragma once

#include <optional>
#include <string>
#include <vector>

#include "host/display/plot_sheet.h"
#include "host/files/safe_file.h"
#include "host/page/page.h"

class TzDbDatabase;

// Plots of the drawing.
//
//   PlotReport const report = tzhost::plotDrawing(*database, {PlotFormat::svg, "plan.svg"});
//   if (report.problem) say(*report.problem);
namespace tzhost {

// The active space, one of the two, or each that holds something: a page of a PDF for each.
enum class PlotSpace { active, model, paper, all };

struct PlotOrder {
    PlotFormat format = PlotFormat::svg;
    std::string file;  // "-" is standard output
    PageChoice page;   // stands above the drawing's own page
    PlotSpace space = PlotSpace::active;
    IfReadOnly ifReadOnly = IfReadOnly::refuse;
};

// Lines without an end, each with the file in it.
struct PlotReport {
    std::optional<std::string> problem;  // what went wrong; nothing was written then
    std::vector<std::string> remarks;    // what the plot lacks
    bool isEmpty = true;                 // nothing is drawn in the spaces that were plotted
};

// Plots a space as it is looked at and writes it whole: a file that is there stays as it was until
// the new one is complete. Without a page the plot is fitted to a page of its own.
[[nodiscard]] PlotReport plotDrawing(TzDbDatabase& database, PlotOrder const& order);

}  // namespace tzhost
