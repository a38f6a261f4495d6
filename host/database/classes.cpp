#include "host/database/classes.h"

#include <array>
#include <utility>

#include "host/database/extensions.h"
#include "host/runtime/class_registry.h"
#include "tz/db/block_table.h"
#include "tz/db/extensions.h"
#include "tz/db/field.h"
#include "tz/db/mtext.h"
#include "tz/db/shapes.h"
#include "tz/db/symbol_table.h"
#include "tz/db/text.h"

namespace {

template <class T>
TzRxObject* make() {
    return new T;
}

// The descriptor of T, made on the first call.
template <class T, class Parent>
TzRxClass* descriptorOf(wchar_t const* name, TzRxCreator creator = nullptr) {
    static TzRxClass* const descriptor = tzhost::hostClass(name, Parent::desc(), creator);
    return descriptor;
}

}  // namespace

TzRxClass* TzDbObject::desc() {
    return descriptorOf<TzDbObject, TzGiDrawable>(L"TzDbObject");
}

TzRxClass* TzDbObject::isA() const {
    return desc();
}

TzRxClass* TzDbEntity::desc() {
    return descriptorOf<TzDbEntity, TzDbObject>(L"TzDbEntity");
}

TzRxClass* TzDbEntity::isA() const {
    return desc();
}

TzRxClass* TzDbMText::desc() {
    return descriptorOf<TzDbMText, TzDbEntity>(L"TzDbMText", make<TzDbMText>);
}

TzRxClass* TzDbMText::isA() const {
    return desc();
}

TzRxClass* TzDbText::desc() {
    return descriptorOf<TzDbText, TzDbEntity>(L"TzDbText", make<TzDbText>);
}

TzRxClass* TzDbText::isA() const {
    return desc();
}

TzRxClass* TzDbAttributeDefinition::desc() {
    return descriptorOf<TzDbAttributeDefinition, TzDbText>(L"TzDbAttributeDefinition",
                                                           make<TzDbAttributeDefinition>);
}

TzRxClass* TzDbAttributeDefinition::isA() const {
    return desc();
}

TzRxClass* TzDbAttribute::desc() {
    return descriptorOf<TzDbAttribute, TzDbText>(L"TzDbAttribute", make<TzDbAttribute>);
}

TzRxClass* TzDbAttribute::isA() const {
    return desc();
}

TzRxClass* TzDbLine::desc() {
    return descriptorOf<TzDbLine, TzDbEntity>(L"TzDbLine", make<TzDbLine>);
}

TzRxClass* TzDbLine::isA() const {
    return desc();
}

TzRxClass* TzDbCircle::desc() {
    return descriptorOf<TzDbCircle, TzDbEntity>(L"TzDbCircle", make<TzDbCircle>);
}

TzRxClass* TzDbCircle::isA() const {
    return desc();
}

TzRxClass* TzDbBlockReference::desc() {
    return descriptorOf<TzDbBlockReference, TzDbEntity>(L"TzDbBlockReference",
                                                        make<TzDbBlockReference>);
}

TzRxClass* TzDbBlockReference::isA() const {
    return desc();
}

TzRxClass* TzDbField::desc() {
    return descriptorOf<TzDbField, TzDbObject>(L"TzDbField", make<TzDbField>);
}

TzRxClass* TzDbField::isA() const {
    return desc();
}

TzRxClass* TzDbSymbolTable::desc() {
    return descriptorOf<TzDbSymbolTable, TzDbObject>(L"TzDbSymbolTable");
}

TzRxClass* TzDbSymbolTable::isA() const {
    return desc();
}

TzRxClass* TzDbSymbolTableRecord::desc() {
    return descriptorOf<TzDbSymbolTableRecord, TzDbObject>(L"TzDbSymbolTableRecord");
}

TzRxClass* TzDbSymbolTableRecord::isA() const {
    return desc();
}

TzRxClass* TzDbLayerTable::desc() {
    return descriptorOf<TzDbLayerTable, TzDbSymbolTable>(L"TzDbLayerTable");
}

TzRxClass* TzDbLayerTable::isA() const {
    return desc();
}

TzRxClass* TzDbLinetypeTable::desc() {
    return descriptorOf<TzDbLinetypeTable, TzDbSymbolTable>(L"TzDbLinetypeTable");
}

TzRxClass* TzDbLinetypeTable::isA() const {
    return desc();
}

TzRxClass* TzDbTextStyleTable::desc() {
    return descriptorOf<TzDbTextStyleTable, TzDbSymbolTable>(L"TzDbTextStyleTable");
}

TzRxClass* TzDbTextStyleTable::isA() const {
    return desc();
}

TzRxClass* TzDbBlockTable::desc() {
    return descriptorOf<TzDbBlockTable, TzDbSymbolTable>(L"TzDbBlockTable");
}

TzRxClass* TzDbBlockTable::isA() const {
    return desc();
}

TzRxClass* TzDbLayerTableRecord::desc() {
    return descriptorOf<TzDbLayerTableRecord, TzDbSymbolTableRecord>(L"TzDbLayerTableRecord",
                                                                     make<TzDbLayerTableRecord>);
}

TzRxClass* TzDbLayerTableRecord::isA() const {
    return desc();
}

TzRxClass* TzDbLinetypeTableRecord::desc() {
    return descriptorOf<TzDbLinetypeTableRecord, TzDbSymbolTableRecord>(
        L"TzDbLinetypeTableRecord", make<TzDbLinetypeTableRecord>);
}

TzRxClass* TzDbLinetypeTableRecord::isA() const {
    return desc();
}

TzRxClass* TzDbTextStyleTableRecord::desc() {
    return descriptorOf<TzDbTextStyleTableRecord, TzDbSymbolTableRecord>(
        L"TzDbTextStyleTableRecord", make<TzDbTextStyleTableRecord>);
}

TzRxClass* TzDbTextStyleTableRecord::isA() const {
    return desc();
}

TzRxClass* TzDbBlockTableRecord::desc() {
    return descriptorOf<TzDbBlockTableRecord, TzDbSymbolTableRecord>(L"TzDbBlockTableRecord",
                                                                     make<TzDbBlockTableRecord>);
}

TzRxClass* TzDbBlockTableRecord::isA() const {
    return desc();
}

TzRxClass* TzDbAnnotativeObjectPE::desc() {
    return descriptorOf<TzDbAnnotativeObjectPE, TzRxObject>(L"TzDbAnnotativeObjectPE");
}

TzRxClass* TzDbAnnotativeObjectPE::isA() const {
    return desc();
}

TzRxClass* TzDbPaperOrientationPE::desc() {
    return descriptorOf<TzDbPaperOrientationPE, TzRxObject>(L"TzDbPaperOrientationPE");
}

TzRxClass* TzDbPaperOrientationPE::isA() const {
    return desc();
}

namespace tzhost {

void registerDatabaseClasses() {
    static bool done = false;
    if (std::exchange(done, true)) return;
    TzRxClass* const classes[] = {
        TzDbObject::desc(),
        TzDbEntity::desc(),
        TzDbMText::desc(),
        TzDbText::desc(),
        TzDbAttributeDefinition::desc(),
        TzDbAttribute::desc(),
        TzDbLine::desc(),
        TzDbCircle::desc(),
        TzDbBlockReference::desc(),
        TzDbField::desc(),
        TzDbSymbolTable::desc(),
        TzDbSymbolTableRecord::desc(),
        TzDbLayerTable::desc(),
        TzDbLinetypeTable::desc(),
        TzDbTextStyleTable::desc(),
        TzDbBlockTable::desc(),
        TzDbLayerTableRecord::desc(),
        TzDbLinetypeTableRecord::desc(),
        TzDbTextStyleTableRecord::desc(),
        TzDbBlockTableRecord::desc(),
        TzDbAnnotativeObjectPE::desc(),
        TzDbPaperOrientationPE::desc(),
    };
    static_cast<void>(classes);  // asking for a descriptor is what registers it
    addDatabaseExtensions();
}

TzString entityKind(TzRxClass const* descriptor) {
    std::array<std::pair<TzRxClass const*, wchar_t const*>, 7> const kKinds{{
        {TzDbMText::desc(), L"MTEXT"},
        {TzDbText::desc(), L"TEXT"},
        {TzDbAttributeDefinition::desc(), L"ATTDEF"},
        {TzDbAttribute::desc(), L"ATTRIB"},
        {TzDbLine::desc(), L"LINE"},
        {TzDbCircle::desc(), L"CIRCLE"},
        {TzDbBlockReference::desc(), L"INSERT"},
    }};
    for (auto const& [each, kind] : kKinds) {
        if (each == descriptor) return kind;
    }
    return {};
}

}  // namespace tzhost
