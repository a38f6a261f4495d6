#include "module/host_calls/lock_tests.h"

#include "tz/db/entity.h"
#include "tz/db/host_services.h"
#include "tz/db/symbol_table.h"
#include "tz/mte/easy_object.h"

bool IsOnLockedLayer(TzDbEntity* entity) {
    EasyObject<TzDbLayerTableRecord> layer;
    if (tzdbOpenObject(layer.object, entity->layerId(), TzDb::kForRead) != Tzad::eOk) return false;
    return layer->isLocked();
}

bool IsLockedFromWorkingSet(TzDbEntity* entity) {
    TzDbWorkingGlobals* globals = tzdbHostApplicationServices()->workingGlobals();
    if (!globals) globals = tzdbDefaultWorkingGlobals();
    if (!globals->hasWorkingSet() || !globals->isWorkingSetActive()) return false;
    TzDbObjectId const id = entity->objectId();
    return !id.isNull() && !id.isInWorkingSet();
}
