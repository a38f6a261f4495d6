#include "apps/tzdraft/commands/placing.h"

#include "apps/tzdraft/commands/record.h"
#include "apps/tzdraft/program_session.h"
#include "host/database/geometry.h"
#include "host/database/user_system.h"
#include "tz/db/block_table.h"
#include "tz/ed/ucs.h"

namespace tzdraft {

TzGePoint3d toWorld(TzGePoint3d const& user) {
    double const from[3] = {user.x, user.y, user.z};
    double to[3] = {user.x, user.y, user.z};
    tzdbUcs2Wcs(from, to, false);
    return {to[0], to[1], to[2]};
}

UserPlane userPlane() {
    tzhost::UserSystem const system = tzhost::currentUserSystem();
    return {system.xAxis, system.xAxis.crossProduct(system.yAxis)};
}

double UserPlane::rotation(double radians) const {
    return radians + tzhost::angleAbout(normal, tzhost::directionAt(normal, 0), xAxis);
}

TzDbEntity* postOpen(std::unique_ptr<TzDbEntity> entity) {
    Opened<TzDbBlockTableRecord> const space(ProgramSession::current().drawing().activeSpace(),
                                             TzDb::kForWrite);
    TzDbObjectId id;
    if (!space || space->appendTzDbEntity(id, entity.get()) != Tzad::eOk) return nullptr;
    return entity.release();
}

void post(std::unique_ptr<TzDbEntity> entity) {
    if (TzDbEntity* const posted = postOpen(std::move(entity))) (void)posted->close();
}

}  // namespace tzdraft
