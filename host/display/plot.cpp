#include "host/display/plot.h"

#include "host/base/fault_point.h"
#include "host/database/drawing.h"
#include "host/display/draw_pass.h"
#include "host/display/record_access.h"
#include "host/files/file_bytes.h"
#include "host/text/local_text.h"

namespace tzhost {
namespace {

void drawActiveSpace(DrawPass& pass, TzDbDatabase& database) {
    auto const* const space = objectOf<TzDbBlockTableRecord>(drawingOf(&database)->activeSpace());
    TzArray<TzDbObjectId> ids;
    if (space) space->entities(ids);
    for (TzDbObjectId const& id : ids)
        pass.draw(objectOf<TzDbEntity>(id));
}

}  // namespace

std::optional<std::string>
plotDrawing(TzDbDatabase& database, PlotFormat format, std::string const& file) {
    if (faultAt("plotDrawing")) return file + ": " + localText("cannot be plotted");
    DrawPass pass(&database, DrawPass::Entities::strokes);
    drawActiveSpace(pass, database);
    if (!pass.isWhole()) return file + ": " + localText("its blocks stand for too much to plot");
    PlotScene const scene = makeScene(pass.list(), viewAxes(activeSpace()));
    std::string const bytes = paintPlot(scene, format);
    if (bytes.empty()) return file + ": " + localText("the picture could not be made");
    if (!writeFileSafely(file, bytes))
        return file + ": " + localText("cannot be written") + ": " + systemReason();
    return std::nullopt;
}

}  // namespace tzhost
