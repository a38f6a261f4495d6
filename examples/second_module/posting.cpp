#include "posting.h"

#include "tz/db/block_table.h"
#include "tz/db/database.h"
#include "tz/db/host_services.h"
#include "tz/ed/ucs.h"
#include "tz/ed/units.h"
#include "tz/ed/variables.h"
#include "tz/mte/easy_object.h"
#include "tz/rx/variables.h"

namespace marks {
namespace {

int intVariable(wchar_t const* name) {
    TzRxVariable const* const variable = TzRxVariablesDictionary::get()->getVariable(name);
    return variable ? variable->intValue() : 0;
}

wchar_t const* activeSpace() {
    bool const isPaper = intVariable(L"TILEMODE") == 0 && intVariable(L"CVPORT") == 1;
    return isPaper ? kPaperSpaceName : kModelSpaceName;
}

bool append(TzDbEntity* entity, TzDbObjectId& id) {
    TzDbDatabase* const database = tzdbHostApplicationServices()->workingDatabase();
    EasyTable<TzDbBlockTable> blocks;
    if (!database || database->getBlockTable(blocks.object, TzDb::kForRead) != Tzad::eOk)
        return false;
    EasyObject<TzDbBlockTableRecord> space;
    return blocks->getAt(activeSpace(), space.object, TzDb::kForWrite) == Tzad::eOk &&
           space->appendTzDbEntity(id, entity) == Tzad::eOk;
}

}  // namespace

TzDbObjectId post(TzDbEntity* entity) {
    TzDbObjectId id;
    if (append(entity, id)) {
        (void)entity->close();  // closes in any case
    } else {
        delete entity;
        id.setNull();
    }
    return id;
}

TzString inUserUnits(TzGePoint3d const& world) {
    double const coordinates[] = {world.x, world.y, world.z};
    double user[3]{};
    if (!tzdbWcs2Ucs(coordinates, user, false)) return {};
    int const unit = intVariable(L"LUNITS");
    int const precision = intVariable(L"LUPREC");
    TzString all;
    for (double const each : user) {
        TzString text;
        if (tzdbRToS(each, unit, precision, text) != Tzad::ePromptNormal) text = L"?";
        if (!all.isEmpty()) all += L", ";
        all += text;
    }
    return all;
}

}  // namespace marks
