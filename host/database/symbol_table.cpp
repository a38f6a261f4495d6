#include "tz/db/symbol_table.h"

#include <string_view>

#include "host/database/drawing.h"
#include "host/database/symbol_imp.h"
#include "host/database/symbol_name.h"
#include "tz/gi/draw.h"
#include "tz/rx/class.h"

using tzhost::faultStatus;
using tzhost::isSymbolName;
using tzhost::SymbolImp;
using tzhost::TableImp;
using tzhost::valuesOf;

namespace {

TableImp::Shared& sharedOf(TzDbSymbolTable const& table) {
    return *valuesOf<TableImp>(table).shared;
}

// Walks the list as it grows; erased records are skipped when told to.
class TableWalk final : public TzDbSymbolTableIterator {
public:
    TableWalk(std::shared_ptr<TableImp::Shared> shared, bool atBeginning, bool skipErased)
        : shared_(std::move(shared)) {
        moveToStart(atBeginning, skipErased);
    }

    void start(bool atBeginning, bool skipErased) override { moveToStart(atBeginning, skipErased); }
    [[nodiscard]] bool done() const override { return !isInside(); }
    void step(bool forward, bool skipErased) override {
        if (isInside()) moveBy(forward ? 1 : -1, skipErased);
    }
    [[nodiscard]] TzDbObjectId getRecordId() const override {
        return isInside() ? TzDbObjectId(items()[static_cast<std::size_t>(at_)]) : TzDbObjectId();
    }

private:
    [[nodiscard]] std::vector<TzDbObjectRecord*> const& items() const {
        return shared_->list.items;
    }
    [[nodiscard]] bool isInside() const {
        return at_ >= 0 && at_ < static_cast<std::ptrdiff_t>(items().size());
    }
    void moveToStart(bool atBeginning, bool skipErased) {
        at_ = atBeginning ? -1 : static_cast<std::ptrdiff_t>(items().size());
        moveBy(atBeginning ? 1 : -1, skipErased);
    }
    void moveBy(std::ptrdiff_t direction, bool skipErased) {
        do {
            at_ += direction;
        } while (isInside() && skipErased && items()[static_cast<std::size_t>(at_)]->erased);
    }

    std::shared_ptr<TableImp::Shared> shared_;
    std::ptrdiff_t at_ = 0;
};

}  // namespace

wchar_t const* TzDbSymbolTableRecord::getName() const {
    return valuesOf<SymbolImp>(*this).name.c_str();
}

Tzad::ErrorStatus TzDbSymbolTableRecord::setName(wchar_t const* name) {
    if (auto const fault = faultStatus("TzDbSymbolTableRecord::setName")) return fault;
    std::wstring next(name ? name : L"");
    if (!isSymbolName(next)) return Tzad::eInvalidSymbolName;
    TzDbObjectRecord const* const record = objectId().record();
    if (record) {
        TzDbObjectId const found = tzhost::Drawing::find(TzDbObjectId(record->owner), next);
        if (!found.isNull() && found != objectId()) return Tzad::eDuplicateKey;
    }
    if (auto const status = tzhost::beginChange(*this)) return status;
    valuesOf<SymbolImp>(*this).name = std::move(next);
    if (record) tzhost::noteNamesChanged();
    return Tzad::eOk;
}

TzDbSymbolTableRecord::TzDbSymbolTableRecord(TzDbObjectImp* imp) : TzDbObject(imp) {}

bool TzDbSymbolTableRecord::subWorldDraw(TzGiWorldDraw* /*draw*/) {
    return true;
}

void TzDbSymbolTableRecord::subViewportDraw(TzGiViewportDraw* /*draw*/) {}

unsigned int TzDbSymbolTableRecord::subSetAttributes(TzGiDrawableTraits* /*traits*/) {
    return 0;
}

TzDbSymbolTable::TzDbSymbolTable(TzDbObjectImp* imp) : TzDbObject(imp) {}

Tzad::ErrorStatus TzDbSymbolTable::getIdAt(wchar_t const* name, TzDbObjectId& id) const {
    id.setNull();
    if (auto const fault = faultStatus("TzDbSymbolTable::getIdAt", Tzad::eKeyNotFound)) {
        return fault;
    }
    if (!isReadEnabled()) return Tzad::eNotOpenForRead;
    id = TzDbObjectId(sharedOf(*this).names.find(sharedOf(*this).list, name ? name : L""));
    return id.isNull() ? Tzad::eKeyNotFound : Tzad::eOk;
}

bool TzDbSymbolTable::has(wchar_t const* name) const {
    return sharedOf(*this).names.find(sharedOf(*this).list, name ? name : L"") != nullptr;
}

Tzad::ErrorStatus TzDbSymbolTable::addRecord(TzDbSymbolTableRecord* record, TzDbObjectId& id) {
    id.setNull();
    if (auto const fault = faultStatus("TzDbSymbolTable::addRecord")) return fault;
    if (!record) return Tzad::eNullObjectPointer;
    if (!isWriteEnabled()) return Tzad::eNotOpenForWrite;
    if (!record->objectId().isNull()) return Tzad::eAlreadyInDatabase;
    // Each kind of table takes its own kind of record.
    std::wstring_view const tableName = isA()->name();
    if (record->isA()->name() != std::wstring(tableName) + L"Record") return Tzad::eWrongObjectType;
    if (!isSymbolName(record->getName())) return Tzad::eInvalidSymbolName;
    if (has(record->getName())) return Tzad::eDuplicateKey;
    TzDbObjectRecord* const table = objectId().record();
    TzDbObjectRecord& added =
        table->drawing->addObject(record, table, tzhost::Drawing::Numbered::service);
    id = TzDbObjectId(&added);
    return Tzad::eOk;
}

TzDbSymbolTableIterator* TzDbSymbolTable::makeIterator(bool atBeginning, bool skipErased) const {
    return new TableWalk(valuesOf<TableImp>(*this).shared, atBeginning, skipErased);
}

bool TzDbSymbolTable::subWorldDraw(TzGiWorldDraw* /*draw*/) {
    return true;
}

void TzDbSymbolTable::subViewportDraw(TzGiViewportDraw* /*draw*/) {}

unsigned int TzDbSymbolTable::subSetAttributes(TzGiDrawableTraits* /*traits*/) {
    return 0;
}

Tzad::ErrorStatus TzDbLayerTable::newIterator(TzDbSymbolTableIterator*& iterator,
                                              bool atBeginning,
                                              bool skipErased) const {
    iterator = nullptr;
    if (auto const fault = faultStatus("TzDbLayerTable::newIterator")) return fault;
    iterator = makeIterator(atBeginning, skipErased);
    return Tzad::eOk;
}

Tzad::ErrorStatus TzDbLinetypeTable::newIterator(TzDbLinetypeTableIterator*& iterator,
                                                 bool atBeginning,
                                                 bool skipErased) const {
    iterator = nullptr;
    if (auto const fault = faultStatus("TzDbLinetypeTable::newIterator")) return fault;
    std::unique_ptr<TzDbSymbolTableIterator> walk(makeIterator(atBeginning, skipErased));
    iterator = new TzDbLinetypeTableIterator(walk.get());
    (void)walk.release();  // the iterator owns it now
    return Tzad::eOk;
}

Tzad::ErrorStatus TzDbTextStyleTable::newIterator(TzDbTextStyleTableIterator*& iterator,
                                                  bool atBeginning,
                                                  bool skipErased) const {
    iterator = nullptr;
    if (auto const fault = faultStatus("TzDbTextStyleTable::newIterator")) return fault;
    std::unique_ptr<TzDbSymbolTableIterator> walk(makeIterator(atBeginning, skipErased));
    iterator = new TzDbTextStyleTableIterator(walk.get());
    (void)walk.release();  // the iterator owns it now
    return Tzad::eOk;
}
