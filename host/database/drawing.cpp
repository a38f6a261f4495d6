#include "host/database/drawing.h"

#include <algorithm>
#include <vector>

#include "host/database/active_space.h"
#include "host/database/classes.h"
#include "host/database/object_list.h"
#include "host/database/open_state.h"
#include "host/database/symbol_imp.h"
#include "tz/db/entity.h"

namespace tzhost {
namespace {

// All drawings of the process.
std::vector<Drawing*>& drawings() {
    static std::vector<Drawing*> all;
    return all;
}

long long lastSerial = 0;

// Adds a record of that name to a table without opening it.
template <class Record>
TzDbObjectId makeRecord(Drawing& drawing, TzDbObjectId table, wchar_t const* name) {
    auto record = std::make_unique<Record>();
    valuesOf<SymbolImp>(*record).name = name;
    TzDbObjectRecord& added =
        drawing.addObject(record.get(), table.record(), Drawing::Numbered::service);
    (void)record.release()->close();
    return TzDbObjectId(&added);
}

template <class Table>
TzDbObjectId makeTable(Drawing& drawing) {
    auto table = std::make_unique<Table>(new TableImp);
    TzDbObjectRecord& added = drawing.addObject(table.get(), nullptr, Drawing::Numbered::service);
    (void)table.release()->close();
    return TzDbObjectId(&added);
}

template <class Table>
Tzad::ErrorStatus
openTable(char const* operation, Table*& table, TzDbObjectId id, TzDb::OpenMode mode) {
    table = nullptr;
    if (auto const fault = faultStatus(operation)) return fault;
    return tzdbOpenObject(table, id, mode);
}

// Handles go up. When a file has used the highest, those that it left out serve.
std::uint64_t freeHandle(std::unordered_map<std::uint64_t, TzDbObjectRecord*> const& taken,
                         std::uint64_t& next) {
    if (next > Drawing::kMaxEntityHandle) next = 1;
    while (taken.contains(next))
        ++next;
    return next;
}

}  // namespace

Drawing::Drawing() : serial_(++lastSerial), undoLog_(*this) {
    drawings().push_back(this);
}

Drawing::~Drawing() {
    if (workingDrawing() == this) setWorkingDrawing(nullptr);
    std::erase(drawings(), this);
    for (TzDbObjectRecord& record : records_) {
        dropOpenings(record);
        delete std::exchange(record.object, nullptr);
    }
}

std::unique_ptr<Drawing> Drawing::create() {
    registerDatabaseClasses();
    std::unique_ptr<Drawing> drawing(new Drawing);
    drawing->makeTables();
    return drawing;
}

void Drawing::makeTables() {
    layers_ = makeTable<TzDbLayerTable>(*this);
    linetypes_ = makeTable<TzDbLinetypeTable>(*this);
    textStyles_ = makeTable<TzDbTextStyleTable>(*this);
    blocks_ = makeTable<TzDbBlockTable>(*this);
    settings_.layer = makeRecord<TzDbLayerTableRecord>(*this, layers_, L"0");
    makeRecord<TzDbLinetypeTableRecord>(*this, linetypes_, L"Continuous");
    settings_.textStyle = makeRecord<TzDbTextStyleTableRecord>(*this, textStyles_, L"Standard");
    modelSpace_ = makeRecord<TzDbBlockTableRecord>(*this, blocks_, kModelSpaceName);
    paperSpace_ = makeRecord<TzDbBlockTableRecord>(*this, blocks_, kPaperSpaceName);
}

TzDbObjectRecord& Drawing::addObject(TzDbObject* object,
                                     TzDbObjectRecord* owner,
                                     Numbered numbered,
                                     std::uint64_t handle) {
    undoLog_.prepareAppend();
    ObjectList* const list = owner ? listOf(*owner) : nullptr;
    if (list && list->items.size() == list->items.capacity()) {
        list->items.reserve(list->items.size() * 2 + 1);
    }
    TzDbObjectRecord& record = records_.emplace_back();
    record.drawing = this;
    record.owner = owner;
    try {
        if (numbered == Numbered::service) handle = nextService_++;
        if (numbered == Numbered::entity && handle == 0)
            handle = freeHandle(byHandle_, nextHandle_);
        if (handle != 0) byHandle_.emplace(handle, &record);
    } catch (...) {
        records_.pop_back();
        throw;
    }
    if (handle <= kMaxEntityHandle) nextHandle_ = std::max(nextHandle_, handle + 1);
    record.handle = handle;
    record.object = object;
    TzDbObjectAccess::imp(*object)->record = &record;
    if (list) addToList(*owner, record);
    openNew(record);
    undoLog_.noteAppended(record);
    return record;
}

void Drawing::numberObject(TzDbObjectRecord& record) {
    if (record.handle != 0) return;
    std::uint64_t const handle = freeHandle(byHandle_, nextHandle_);
    byHandle_.emplace(handle, &record);
    record.handle = handle;
    nextHandle_ = handle + 1;
}

TzDbObjectId Drawing::objectAt(std::uint64_t handle) const {
    auto const at = byHandle_.find(handle);
    return TzDbObjectId(at == byHandle_.end() ? nullptr : at->second);
}

TzDbObjectId Drawing::find(TzDbObjectId table, std::wstring_view name) {
    auto& shared = *valuesOf<TableImp>(*table.record()->object).shared;
    return TzDbObjectId(shared.names.find(shared.list, name));
}

TzDbObjectId Drawing::activeSpace() const {
    return isPaperActive() ? paperSpace_ : modelSpace_;
}

Tzad::ErrorStatus Drawing::getBlockTable(TzDbBlockTable*& table, TzDb::OpenMode mode) {
    return openTable("TzDbDatabase::getBlockTable", table, blocks_, mode);
}

Tzad::ErrorStatus Drawing::getLayerTable(TzDbLayerTable*& table, TzDb::OpenMode mode) {
    return openTable("TzDbDatabase::getLayerTable", table, layers_, mode);
}

Tzad::ErrorStatus Drawing::getLinetypeTable(TzDbLinetypeTable*& table, TzDb::OpenMode mode) {
    return openTable("TzDbDatabase::getLinetypeTable", table, linetypes_, mode);
}

Tzad::ErrorStatus Drawing::getTextStyleTable(TzDbTextStyleTable*& table, TzDb::OpenMode mode) {
    return openTable("TzDbDatabase::getTextStyleTable", table, textStyles_, mode);
}

Drawing* drawingWithSerial(long long serial) {
    auto const at = std::find_if(drawings().begin(), drawings().end(),
                                 [=](Drawing const* each) { return each->serial() == serial; });
    return at == drawings().end() ? nullptr : *at;
}

Drawing* drawingOf(TzDbDatabase* database) {
    if (!database) return workingDrawing();
    auto const at = std::find_if(drawings().begin(), drawings().end(), [=](Drawing const* each) {
        return static_cast<TzDbDatabase const*>(each) == database;
    });
    return at == drawings().end() ? nullptr : *at;
}

}  // namespace tzhost
