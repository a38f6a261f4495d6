#include "module/styles/style_rules.h"
#include "tz/db/database.h"
#include "tz/db/extensions.h"
#include "tz/db/host_services.h"

wchar_t const* GetTextStyleName(TzDbObjectId const& style) {
    EasyObject<TzDbTextStyleTableRecord> record;
    if (tzdbOpenObject(record.object, style, TzDb::kForRead) != Tzad::eOk) return nullptr;
    return record->getName();
}

wchar_t const* GetCurrentTextStyleName() {
    TzDbDatabase const* const database = tzdbHostApplicationServices()->workingDatabase();
    return database ? GetTextStyleName(database->textstyle()) : nullptr;
}

TzDbObjectId GetTextStyleID(TzString const& name) {
    TzDbObjectId style;
    (void)GetIDFromTextStyleName(name, style);
    return style;
}

bool GetTextStyleNameFromID(TzDbObjectId const& style, TzString& name) {
    wchar_t const* const found = GetTextStyleName(style);
    if (found) name = found;
    return found != nullptr;
}

bool GetIDFromTextStyleName(TzString const& name, TzDbObjectId& style) {
    style.setNull();
    TzDbDatabase* const database = tzdbHostApplicationServices()->workingDatabase();
    EasyTable<TzDbTextStyleTable> table;
    if (!database || database->getTextStyleTable(table.object, TzDb::kForRead) != Tzad::eOk)
        return false;
    if (table->getIdAt(name, style) == Tzad::eOk) return true;
    style.setNull();
    return false;
}

bool StyleIsAnnotative(TzDbObjectId style) {
    EasyObject<TzDbObject> object;
    if (tzdbOpenObject(object.object, style, TzDb::kForRead) != Tzad::eOk) return false;
    auto* const extension = tzrxQuery<TzDbAnnotativeObjectPE>(object.object);
    return extension && extension->annotative(object.object);
}
