#include "module/host_calls/space_posting.h"

#include <memory>

#include "tz/db/database.h"
#include "tz/db/host_services.h"
#include "tz/mte/easy_object.h"

namespace {

// Opens a space's record for write.
Tzad::ErrorStatus openSpace(TzDbBlockTableRecord*& space, bool paperSpace) {
    TzDbDatabase* const database = tzdbHostApplicationServices()->workingDatabase();
    if (!database) return Tzad::eNoDocument;
    EasyTable<TzDbBlockTable> table;
    Tzad::ErrorStatus const status = database->getBlockTable(table.object, TzDb::kForRead);
    if (status != Tzad::eOk) return status;
    return table->getAt(paperSpace ? kPaperSpaceName : kModelSpaceName, space, TzDb::kForWrite);
}

Tzad::ErrorStatus appendToSpace(TzDbEntity* entity, TzDbObjectId& id, bool paperSpace) {
    EasyObject<TzDbBlockTableRecord> space;
    Tzad::ErrorStatus const status = openSpace(space.object, paperSpace);
    return status == Tzad::eOk ? space->appendTzDbEntity(id, entity) : status;
}

}  // namespace

Tzad::ErrorStatus postToDb(TzDbEntity* entity, TzDbObjectId& id, bool paperSpace) {
    std::unique_ptr<TzDbEntity> owned(entity);
    Tzad::ErrorStatus const status = appendToSpace(entity, id, paperSpace);
    if (status != Tzad::eOk) return status;
    return owned.release()->close();
}

Tzad::ErrorStatus postToDb(TzDbEntity* entity, bool paperSpace) {
    TzDbObjectId id;
    return postToDb(entity, id, paperSpace);
}
