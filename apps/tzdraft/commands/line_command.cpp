#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/record.h"
#include "apps/tzdraft/session.h"
#include "tz/db/shapes.h"
#include "tz/ed/ucs.h"

namespace tzdraft {
namespace {

TzGePoint3d toWorld(TzGePoint3d const& user) {
    double const from[3] = {user.x, user.y, user.z};
    double to[3] = {user.x, user.y, user.z};
    tzdbUcs2Wcs(from, to, false);
    return {to[0], to[1], to[2]};
}

}  // namespace

void post(TzDbEntity* entity) {
    entity->setDatabaseDefaults(&Session::current().drawing());
    Opened<TzDbBlockTableRecord> const space(Session::current().drawing().activeSpace(),
                                             TzDb::kForWrite);
    TzDbObjectId id;
    if (space && space->appendTzDbEntity(id, entity) == Tzad::eOk) {
        (void)entity->close();
    } else {
        delete entity;
    }
}

void lineCommand() {
    PointAnswer from = askPoint(L"First point", nullptr);
    while (from.asked == Asked::given) {
        PointAnswer const to = askPoint(L"Next point", &from.point);
        if (to.asked != Asked::given) return;
        auto* const line = new TzDbLine;
        (void)line->setStartPoint(toWorld(from.point));  // the host takes only finite points
        (void)line->setEndPoint(toWorld(to.point));
        post(line);
        from = to;
    }
}

}  // namespace tzdraft
