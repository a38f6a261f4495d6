#include "host/display/plot.h"

#include <new>

#include "host/base/fault_point.h"
#include "host/database/drawing.h"
#include "host/display/draw_pass.h"
#include "host/display/record_access.h"
#include "host/files/safe_file.h"
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
plotDrawing(TzDbDatabase& database, PlotFormat format, std::string const& file) try {
    if (faultAt("plotDrawing")) return file + ": " + localText("cannot be plotted");
    DrawPass pass(&database, DrawPass::Entities::strokes);
    drawActiveSpace(pass, database);
    if (pass.hasTooManyLetters())
        return file + ": " + localText("it has more letters than a plot takes");
    if (!pass.isWhole()) return file + ": " + localText("its blocks stand for too much to plot");
    PlotScene const scene = makeScene(pass.takeList(), viewAxes(activeSpace()));
    SafeFile target(file);
    bool written = target.isOpen();
    bool const painted = written && paintPlot(scene, format, [&](std::string_view bytes) {
                             written = written && target.write(bytes);
                             return written;
                         });
    if (written && !painted) return file + ": " + localText("the picture could not be made");
    if (!written || !target.commit())
        return file + ": " + localText("cannot be written") + ": " + target.reason();
    return std::nullopt;
} catch (std::bad_alloc const&) {
    return file + ": " + localText("cannot be written") + ": " + localText("memory ran short");
}

}  // namespace tzhost
