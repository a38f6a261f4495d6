#include <algorithm>
#include <string>

#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/record.h"
#include "apps/tzdraft/commands/selected.h"
#include "apps/tzdraft/program_texts.h"
#include "host/settings/variables.h"
#include "tz/db/shapes.h"
#include "tz/db/text.h"
#include "tz/ed/print.h"
#include "tz/ed/units.h"
#include "tz/rx/class.h"

namespace tzdraft {
namespace {

// Kinds of entities that have a word in other languages, named as their classes are.
constexpr wchar_t const* kKinds[] = {
    forLocalText(L"Attribute"),      forLocalText(L"AttributeDefinition"),
    forLocalText(L"BlockReference"), forLocalText(L"Circle"),
    forLocalText(L"Line"),
};

constexpr double kDegreesPerRadian = 180 / 3.14159265358979323846;

// In the drawing's units.
TzString length(double value) {
    tzhost::Variables const& variables = tzhost::Variables::instance();
    TzString text;
    // Every finite value has a text.
    (void)tzdbRToS(value, static_cast<int>(variables.number(L"LUNITS")),
                   static_cast<int>(variables.number(L"LUPREC")), text);
    return text;
}

TzString point(TzGePoint3d const& place) {
    return length(place.x) + L", " + length(place.y) + L", " + length(place.z);
}

TzString degrees(double radians) {
    return TzString::formatted(localText(L"%.4g degrees"), radians * kDegreesPerRadian);
}

void row(wchar_t const* name, TzString const& value) {
    tzutPrintf(L"\n  %-16ls %ls", name, value.kwszPtr());
}

void listMText(TzDbMText const& text) {
    row(localText(L"location"), point(text.location()));
    row(localText(L"attachment"), TzString::formatted(L"%d", static_cast<int>(text.attachment())));
    row(localText(L"text height"), length(text.textHeight()));
    row(localText(L"rotation"), degrees(text.rotation()));
    row(localText(L"width"),
        text.width() > 0 ? length(text.width()) : TzString(localText(L"no wrapping")));
    row(localText(L"measured"), length(text.actualWidth()) + L" x " + length(text.actualHeight()));
    TzArray<TzGePoint3d> corners;
    text.getBoundingPoints(corners);
    if (corners.length() == 4) {
        row(localText(L"upper left"), point(corners[0]));
        row(localText(L"lower right"), point(corners[3]));
    }
    if (text.columnType() != TzDbMText::kNoColumns) {
        TextEditorColumns const columns = text.columns();
        row(localText(L"columns"),
            TzString::formatted(localText(L"%ls, width %ls, gutter %ls"),
                                localText(columns.columnType == TzDbMText::kStaticColumns
                                              ? forLocalText(L"static")
                                              : forLocalText(L"dynamic")),
                                length(columns.columnWidth).kwszPtr(),
                                length(columns.columnGutter).kwszPtr()));
    }
    row(localText(L"contents"), text.contents());
}

void listText(TzDbText const& text) {
    row(localText(L"position"), point(text.position()));
    row(localText(L"text height"), length(text.height()));
    row(localText(L"rotation"), degrees(text.rotation()));
    row(localText(L"text"), text.textString());
}

void listLine(TzDbLine const& line) {
    row(localText(L"from"), point(line.startPoint()));
    row(localText(L"to"), point(line.endPoint()));
    row(localText(L"length"), length(line.startPoint().distanceTo(line.endPoint())));
}

void listCircle(TzDbCircle const& circle) {
    row(localText(L"center"), point(circle.center()));
    row(localText(L"radius"), length(circle.radius()));
}

void listReference(TzDbBlockReference const& reference) {
    row(localText(L"position"), point(reference.position()));
    row(localText(L"scale"), TzString::formatted(L"%g", reference.scale()));
}

// Tells about the entity when it is of the class; false when it is not.
template <class Entity>
bool listAs(TzDbEntity const& entity, void (*list)(Entity const&)) {
    auto const* const as = tzrxCast<Entity>(static_cast<TzRxObject const*>(&entity));
    if (as) list(*as);
    return as != nullptr;
}

// "TzDbLine" and so on: the name after the prefix is the drafter's word.
std::wstring kindOf(TzDbEntity const& entity) {
    std::wstring name = std::wstring(entity.isA()->name()).substr(4);
    for (wchar_t const* const each : kKinds) {
        if (name == each) return localText(each);
    }
    return name;
}

void listEntity(TzDbEntity const& entity) {
    tzutPrintf(localText(L"\n%ls  #%llX, layer \"%ls\""), kindOf(entity).c_str(),
               static_cast<unsigned long long>(entity.objectId().handle()),
               entity.layer().kwszPtr());
    (void)(listAs(entity, listMText) || listAs(entity, listText) || listAs(entity, listLine) ||
           listAs(entity, listCircle) || listAs(entity, listReference));
}

}  // namespace

void listCommand() {
    std::vector<TzDbObjectId> const ids = selectEntities(OnLockedLayers::included);
    for (TzDbObjectId const id : ids) {
        Opened<TzDbEntity> const entity(id, TzDb::kForRead);
        if (entity) listEntity(*entity.get());
    }
    if (!ids.empty()) tzutPrintf(L"\n");
}

}  // namespace tzdraft
