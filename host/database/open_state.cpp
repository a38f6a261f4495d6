#include "host/database/open_state.h"

#include <charconv>

#include "host/base/audit.h"
#include "host/base/event_sink.h"
#include "host/base/memory_faults.h"
#include "host/database/drawing.h"
#include "host/database/entity_imp.h"
#include "host/database/symbol_imp.h"
#include "tz/db/entity.h"
#include "tz/db/field.h"

namespace tzhost {
namespace {

void reportWrite(TzDbObjectRecord const& record) {
    if (!eventsWanted() || !record.object->isKindOf(TzDbEntity::desc())) return;
    reportEvent([&] {
        return Event{{"event", "write"}, {"handle", utf8(handleText(record.handle))}};
    });
}

}  // namespace

TzDbObjectRecord* openRecordOf(TzDbObject const& object) {
    TzDbObjectImp const* const imp = TzDbObjectAccess::imp(object);
    if (!imp) return nullptr;
    return imp->embedder ? openRecordOf(*imp->embedder) : imp->record;
}

bool isOnLockedLayer(TzDbObjectRecord const& record) {
    TzDbObjectRecord const* const layer = TzDbObjectAccess::imp(*record.object)->lockingLayer();
    return layer && layer->object && valuesOf<LayerImp>(*layer->object).locked;
}

Tzad::ErrorStatus openRecord(TzDbObjectRecord& record, TzDb::OpenMode mode) {
    if (mode != TzDb::kForWrite) {
        if (record.writer) return Tzad::eWasOpenForWrite;
        ++record.readers;
    } else {
        if (record.writer) return Tzad::eAlreadyOpenForWrite;
        if (record.readers > 0) return Tzad::eWasOpenForRead;
        if (isOnLockedLayer(record)) return Tzad::eOnLockedLayer;
        record.writer = true;
    }
    ++audit().openObjects;
    return Tzad::eOk;
}

void openNew(TzDbObjectRecord& record) noexcept {
    record.writer = true;
    record.changed = true;
    ++audit().openObjects;
}

void dropOpenings(TzDbObjectRecord& record) noexcept {
    audit().openObjects -= record.writer ? 1 : record.readers;
    record.writer = false;
    record.readers = 0;
    if (record.highlighted) --audit().highlighted;
    record.highlighted = false;
}

HostOpening::HostOpening(TzDbObjectRecord& record)
    : record_(record), wasWriter_(std::exchange(record.writer, true)) {}

HostOpening::~HostOpening() {
    record_.writer = wasWriter_;
}

TzString handleText(std::uint64_t handle) {
    constexpr char const* kDigits = "0123456789ABCDEF";
    std::wstring text;
    do {
        text.insert(text.begin(), static_cast<wchar_t>(kDigits[handle % 16]));
        handle /= 16;
    } while (handle != 0);
    return text;
}

std::optional<std::uint64_t> readHandle(std::string_view text) {
    constexpr int kHexadecimal = 16;
    std::uint64_t handle = 0;
    char const* const end = text.data() + text.size();
    auto const [stop, error] = std::from_chars(text.data(), end, handle, kHexadecimal);
    bool const isWhole = error == std::errc() && stop == end;
    bool const isEntity = handle > 0 && handle <= Drawing::kMaxEntityHandle;
    return isWhole && isEntity ? std::optional(handle) : std::nullopt;
}

}  // namespace tzhost

using tzhost::faultStatus;
using tzhost::openRecordOf;

bool TzDbObject::isReadEnabled() const {
    TzDbObjectRecord const* const record = openRecordOf(*this);
    return !record || record->writer || record->readers > 0;
}

bool TzDbObject::isWriteEnabled() const {
    TzDbObjectRecord const* const record = openRecordOf(*this);
    return !record || record->writer;
}

// Closes even when the fault plan makes it report a failure, like everything that gives back.
Tzad::ErrorStatus TzDbObject::close() {
    tzhost::MemoryFaultPause const givesBack;
    Tzad::ErrorStatus const fault = faultStatus("TzDbObject::close");
    TzDbObjectRecord* const record = imp_ ? imp_->record : nullptr;
    if (!record) return Tzad::eNoDatabase;
    if (!record->writer && record->readers == 0) return Tzad::eNotOpenForRead;
    --tzhost::audit().openObjects;
    if (record->writer) {
        record->writer = false;
    } else {
        --record->readers;
    }
    if (record->changed && record->readers == 0) {
        record->changed = false;
        tzhost::reportWrite(*record);
    }
    return fault;
}

Tzad::ErrorStatus TzDbObject::upgradeOpen() {
    if (auto const fault = faultStatus("TzDbObject::upgradeOpen", Tzad::eOnLockedLayer)) {
        return fault;
    }
    TzDbObjectRecord* const record = openRecordOf(*this);
    if (!record || record->writer) return Tzad::eAlreadyOpenForWrite;
    if (record->readers == 0) return Tzad::eNotOpenForRead;
    if (record->readers > 1) return Tzad::eWasOpenForRead;
    if (tzhost::isOnLockedLayer(*record)) return Tzad::eOnLockedLayer;
    record->readers = 0;
    record->writer = true;
    return Tzad::eOk;
}

Tzad::ErrorStatus TzDbObject::downgradeOpen() {
    tzhost::MemoryFaultPause const givesBack;
    Tzad::ErrorStatus const fault = faultStatus("TzDbObject::downgradeOpen");
    TzDbObjectRecord* const record = openRecordOf(*this);
    if (!record) return Tzad::eNoDatabase;
    if (!record->writer) return Tzad::eNotOpenForWrite;
    record->writer = false;
    record->readers = 1;
    return fault;
}

Tzad::ErrorStatus
tzdbOpenTzDbObject(TzDbObject*& object, TzDbObjectId id, TzDb::OpenMode mode, bool erasedToo) {
    object = nullptr;
    if (auto const fault = faultStatus("tzdbOpenObject")) return fault;
    TzDbObjectRecord* const record = id.record();
    if (!record || !record->object) return Tzad::eNullObjectId;
    if (record->erased && !erasedToo) return Tzad::eWasErased;
    if (auto const status = tzhost::openRecord(*record, mode)) return status;
    object = record->object;
    return Tzad::eOk;
}
