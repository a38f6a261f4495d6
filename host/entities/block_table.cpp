#include "tz/db/block_table.h"

#include "host/database/drawing.h"
#include "host/database/entity_imp.h"
#include "host/database/geometry.h"
#include "host/database/symbol_imp.h"
#include "host/entities/new_entity.h"

using tzhost::BlockImp;
using tzhost::faultStatus;
using tzhost::valuesOf;

TzDbBlockTableRecord::TzDbBlockTableRecord() : TzDbSymbolTableRecord(new BlockImp) {}

TzGePoint3d TzDbBlockTableRecord::origin() const {
    return valuesOf<BlockImp>(*this).origin;
}

Tzad::ErrorStatus TzDbBlockTableRecord::setOrigin(TzGePoint3d const& origin) {
    return tzhost::assign(*this, "TzDbBlockTableRecord::setOrigin", &BlockImp::origin, origin,
                          tzhost::isFinite(origin), Tzad::eDegenerateGeometry);
}

Tzad::ErrorStatus TzDbBlockTableRecord::appendTzDbEntity(TzDbObjectId& id, TzDbEntity* entity) {
    id.setNull();
    if (auto const fault = faultStatus("TzDbBlockTableRecord::appendTzDbEntity")) return fault;
    return tzhost::appendEntity(*this, id, entity);
}

void TzDbBlockTableRecord::entities(TzArray<TzDbObjectId>& ids) const {
    ids.removeAll();
    for (TzDbObjectRecord* const each : valuesOf<BlockImp>(*this).entities->items) {
        if (!each->erased) ids.append(TzDbObjectId(each));
    }
}

Tzad::ErrorStatus TzDbBlockTable::getAt(wchar_t const* name,
                                        TzDbBlockTableRecord*& record,
                                        TzDb::OpenMode mode) const {
    record = nullptr;
    if (auto const fault = faultStatus("TzDbBlockTable::getAt")) return fault;
    TzDbObjectId id;
    if (auto const status = getIdAt(name, id)) return status;
    return tzdbOpenObject(record, id, mode);
}
