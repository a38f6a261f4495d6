#include "module/styles/style_rules.h"
#include "tz/db/database.h"
#include "tz/db/host_services.h"

bool IsVerticalTTF(EasyObject<TzDbTextStyleTableRecord>& record) {
    if (!record.object) return false;
    TzString typeface;
    bool bold = false;
    bool italic = false;
    int charset = 0;
    int pitchAndFamily = 0;
    if (record->font(typeface, bold, italic, charset, pitchAndFamily) != Tzad::eOk) return false;
    return typeface.getAt(0) == L'@';
}

bool IsVerticalTTF() {
    TzDbDatabase const* const database = tzdbHostApplicationServices()->workingDatabase();
    EasyObject<TzDbTextStyleTableRecord> record;
    if (!database ||
        tzdbOpenObject(record.object, database->textstyle(), TzDb::kForRead) != Tzad::eOk)
        return false;
    return IsVerticalTTF(record);
}
