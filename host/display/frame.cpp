#include "host/display/frame.h"

#include <string>

#include "host/database/true_color.h"
#include "host/display/draw_pass.h"
#include "host/display/record_access.h"
#include "tz/db/entity.h"
#include "tz/db/symbol_table.h"

namespace tzhost {
namespace {

// Three numbers; a negative zero is a zero.
template <class Triple>
Event tripleOf(Triple const& value) {
    return Event::array({value.x + 0.0, value.y + 0.0, value.z + 0.0});
}

Event colorOf(TzCmEntityColor const& color) {
    return color.isByColor() ? Event(trueColorText(color)) : Event(color.colorIndex());
}

std::string linetypeOf(TzDbObjectId id) {
    auto const* const linetype = objectOf<TzDbLinetypeTableRecord>(id);
    return linetype ? utf8(TzString(linetype->getName())) : std::string();
}

Event eventOf(DrawPen const& pen, DrawnLines const& lines) {
    Event points = Event::array();
    for (TzGePoint3d const& each : lines.points)
        points.push_back(tripleOf(each));
    if (lines.closed && !lines.points.empty()) points.push_back(tripleOf(lines.points.front()));
    return {{"op", "polyline"},
            {"points", std::move(points)},
            {"color", colorOf(pen.color)},
            {"lineWeight", pen.lineWeight},
            {"linetype", linetypeOf(pen.linetype)}};
}

Event eventOf(DrawPen const& pen, DrawnText const& text) {
    return {{"op", "text"},
            {"string", utf8(text.text)},
            {"position", tripleOf(text.position)},
            {"normal", tripleOf(text.normal)},
            {"direction", tripleOf(text.direction)},
            {"size", text.style.textSize()},
            {"vertical", text.style.isVertical()},
            {"color", colorOf(pen.color)}};
}

Event eventOf(DrawPen const& /*pen*/, DrawnEntity const& entity) {
    return {{"op", "entity"}, {"type", utf8(entity.type)}, {"position", tripleOf(entity.position)}};
}

}  // namespace

Event frameEvent(DrawList const& list) {
    Event draw = Event::array();
    for (DrawOp const& op : list) {
        draw.push_back(
            std::visit([&](auto const& what) { return eventOf(op.pen, what); }, op.what));
    }
    return {{"event", "frame"}, {"draw", std::move(draw)}};
}

void reportFrame(TzDbEntity* entity, TzDbDatabase* database) {
    DrawPass pass(database, DrawPass::Entities::whole);
    pass.draw(entity);
    reportEvent([&] { return frameEvent(pass.list()); });
}

}  // namespace tzhost
