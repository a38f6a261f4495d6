#include "tz/db/object.h"

#include <algorithm>
#include <exception>

#include "host/database/drawing.h"
#include "host/database/object_list.h"
#include "host/database/open_state.h"
#include "host/database/symbol_imp.h"
#include "tz/db/field.h"
#include "tz/rx/class.h"

using tzhost::faultStatus;

TzDbObject::TzDbObject(TzDbObjectImp* imp) : imp_(imp) {
    if (imp_) imp_->settle(*this);
}

TzDbObject::~TzDbObject() {
    if (imp_ && imp_->record && imp_->record->object == this) {
        imp_->record->object = nullptr;
        imp_->record->erased = true;
        imp_->record->drawing->changes().note(*imp_->record, tzhost::ChangeJournal::Kind::values);
    }
    delete imp_;
}

TzDbObjectId TzDbObject::objectId() const {
    return TzDbObjectId(imp_ ? imp_->record : nullptr);
}

TzDbDatabase* TzDbObject::database() const {
    TzDbObjectRecord const* const record = tzhost::openRecordOf(*this);
    return record ? record->drawing : nullptr;
}

bool TzDbObject::isErased() const {
    return imp_ && imp_->record && imp_->record->erased;
}

namespace {

// Whether anything of the drawing names a record of a table; the fixed ones count as named.
bool isInUse(TzDbObjectRecord const& record) {
    tzhost::Drawing const& drawing = *record.drawing;
    TzDbObjectId const id(const_cast<TzDbObjectRecord*>(&record));
    std::wstring const& name = tzhost::valuesOf<tzhost::SymbolImp>(*record.object).name;
    if (id == drawing.clayer() || id == drawing.textstyle() || id == drawing.modelSpace() ||
        id == drawing.paperSpace() || name == L"0" || name == L"Continuous") {
        return true;
    }
    auto const& records = drawing.records();
    return std::any_of(records.begin(), records.end(), [&](TzDbObjectRecord const& each) {
        return !each.erased && each.object &&
               TzDbObjectAccess::imp(*each.object)->refersTo(&record);
    });
}

}  // namespace

Tzad::ErrorStatus TzDbObject::erase(bool erasing) {
    if (auto const fault = faultStatus("TzDbObject::erase")) return fault;
    TzDbObjectRecord* const record = imp_ ? imp_->record : nullptr;
    if (!record) return Tzad::eNoDatabase;
    if (!record->writer) return Tzad::eNotOpenForWrite;
    if (isKindOf(TzDbSymbolTable::desc())) return Tzad::eNotApplicable;
    bool const isSymbol = isKindOf(TzDbSymbolTableRecord::desc());
    if (isSymbol && erasing && isInUse(*record)) return Tzad::eInUse;
    tzhost::beginHostChange(*this);
    imp_->onErase(erasing);
    record->erased = erasing;
    if (isSymbol) tzhost::noteNamesChanged();
    return Tzad::eOk;
}

TzDbObject* TzDbObject::clone() const {
    if (faultStatus("TzDbObject::clone")) return nullptr;
    if (!imp_) return nullptr;
    std::unique_ptr<TzDbObject> copy(static_cast<TzDbObject*>(isA()->create()));
    if (!copy) return nullptr;
    std::unique_ptr<TzDbObjectImp> values = imp_->copy();
    values->loosen();
    TzDbObjectAccess::exchange(*copy, std::move(values));
    return copy.release();
}

namespace {

// A field that cannot be evaluated is attached all the same; what fails in it shows "####".
void evaluateAttached(TzDbField& field, tzhost::Drawing& drawing) try {
    (void)field.evaluate(0x20, &drawing);
} catch (std::exception const&) {
    // Its owner shows the text from before.
}

}  // namespace

Tzad::ErrorStatus TzDbObject::setField(wchar_t const* key, TzDbField* field, TzDbObjectId& id) {
    id.setNull();
    if (auto const fault = faultStatus("TzDbObject::setField")) return fault;
    if (!field) return Tzad::eNullObjectPointer;
    TzDbObjectRecord* const record = imp_ ? imp_->record : nullptr;
    if (!record) return Tzad::eNoDatabase;
    if (!record->writer) return Tzad::eNotOpenForWrite;
    if (!field->objectId().isNull()) return Tzad::eAlreadyInDatabase;
    tzhost::beginHostChange(*this);
    if (!imp_->fields) imp_->fields = std::make_unique<tzhost::FieldLinks>();
    auto& links = *imp_->fields;
    links.reserve(links.size() + 1);
    std::wstring name(key ? key : L"");
    auto const old = std::find_if(links.begin(), links.end(),
                                  [&](auto const& link) { return link.first == name; });
    if (old != links.end()) tzhost::beginHostChange(*old->second.record()->object);
    // Once the drawing has the field nothing may throw: the caller would delete it as its own.
    TzDbObjectRecord& added =
        record->drawing->addObject(field, record, tzhost::Drawing::Numbered::service);
    id = TzDbObjectId(&added);
    if (old != links.end()) {
        old->second.record()->erased = true;
        old->second = id;
    } else {
        links.emplace_back(std::move(name), id);
    }
    evaluateAttached(*field, *record->drawing);
    return Tzad::eOk;
}

Tzad::ErrorStatus
TzDbObject::getField(wchar_t const* key, TzDbField*& field, TzDb::OpenMode mode) const {
    field = nullptr;
    if (auto const fault = faultStatus("TzDbObject::getField")) return fault;
    if (!imp_ || !imp_->fields) return Tzad::eKeyNotFound;
    for (auto const& [name, id] : *imp_->fields) {
        if (name == (key ? key : L"")) return tzdbOpenObject(field, id, mode);
    }
    return Tzad::eKeyNotFound;
}

bool WritableTzDbObject::replaceObject(TzDbObject* object) {
    revertRead();
    object_ = object;
    if (!object) return false;
    if (object->isWriteEnabled()) return true;
    upgraded_ = object->upgradeOpen() == Tzad::eOk;
    return upgraded_;
}

void WritableTzDbObject::revertWrite() {
    if (object_ && upgraded_) (void)object_->downgradeOpen();  // back to read in any case
    upgraded_ = false;
}

void WritableTzDbObject::revertRead() {
    revertWrite();
    if (object_) (void)object_->close();  // closes in any case
    object_ = nullptr;
}

WritableTzDbObject::~WritableTzDbObject() {
    revertRead();
}
