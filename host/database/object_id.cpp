#include "tz/db/object_id.h"

#include "host/database/drawing.h"
#include "host/database/object_imp.h"
#include "tz/rx/status.h"

TzDbObjectId const TzDbObjectId::kNull{};

TzRxClass* TzDbObjectId::objectClass() const {
    return record_ && record_->object ? record_->object->isA() : nullptr;
}

TzDbDatabase* TzDbObjectId::database() const {
    return record_ ? record_->drawing : nullptr;
}

std::uint64_t TzDbObjectId::handle() const {
    return record_ ? record_->handle : 0;
}

bool TzDbObjectId::isErased() const {
    return record_ && record_->erased;
}

bool TzDbObjectId::isInWorkingSet() const {
    return record_ && record_->inWorkingSet;
}

// An older name is the handle and the serial number of the drawing, so that the name of an object
// whose drawing is gone is recognised.
int tzdbGetObjectId(TzDbObjectId& id, long long const* name) {
    id.setNull();
    if (auto const fault = tzhost::faultStatus("tzdbGetObjectId", Tzad::eUnknownHandle)) {
        return fault;
    }
    if (!name) return Tzad::eInvalidInput;
    tzhost::Drawing const* const drawing = tzhost::drawingWithSerial(name[1]);
    if (drawing) id = drawing->objectAt(static_cast<std::uint64_t>(name[0]));
    return id.isNull() ? Tzad::eUnknownHandle : Tzad::eOk;
}

int tzdbGetTzsName(long long* name, TzDbObjectId id) {
    if (auto const fault = tzhost::faultStatus("tzdbGetTzsName", Tzad::eNullObjectId)) {
        return fault;
    }
    if (!name) return Tzad::eInvalidInput;
    name[0] = name[1] = 0;
    if (id.isNull()) return Tzad::eNullObjectId;
    name[0] = static_cast<long long>(id.handle());
    name[1] = id.record()->drawing->serial();
    return Tzad::eOk;
}
