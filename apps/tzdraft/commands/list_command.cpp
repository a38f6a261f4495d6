#include <algorithm>
#include <string>

#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/record.h"
#include "apps/tzdraft/commands/selected.h"
#include "host/base/variables.h"
#include "tz/db/shapes.h"
#include "tz/db/text.h"
#include "tz/ed/print.h"
#include "tz/ed/units.h"
#include "tz/rx/class.h"

namespace tzdraft {
namespace {

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

void row(wchar_t const* name, TzString const& value) {
    tzutPrintf(L"\n  %-16ls %ls", name, value.kwszPtr());
}

void listMText(TzDbMText const& text) {
    row(L"location", point(text.location()));
    row(L"attachment", TzString::formatted(L"%d", static_cast<int>(text.attachment())));
    row(L"text height", length(text.textHeight()));
    row(L"rotation", TzString::formatted(L"%.4g degrees", text.rotation() * kDegreesPerRadian));
    row(L"width", text.width() > 0 ? length(text.width()) : TzString(L"no wrapping"));
    row(L"measured", length(text.actualWidth()) + L" x " + length(text.actualHeight()));
    TzArray<TzGePoint3d> corners;
    text.getBoundingPoints(corners);
    if (corners.length() == 4) {
        row(L"upper left", point(corners[0]));
        row(L"lower right", point(corners[3]));
    }
    if (text.columnType() != TzDbMText::kNoColumns) {
        TextEditorColumns const columns = text.columns();
        row(L"columns",
            TzString::formatted(
                L"%ls, width %ls, gutter %ls",
                columns.columnType == TzDbMText::kStaticColumns ? L"static" : L"dynamic",
                length(columns.columnWidth).kwszPtr(), length(columns.columnGutter).kwszPtr()));
    }
    row(L"contents", text.contents());
}

void listText(TzDbText const& text) {
    row(L"position", point(text.position()));
    row(L"text height", length(text.height()));
    row(L"rotation", TzString::formatted(L"%.4g degrees", text.rotation() * kDegreesPerRadian));
    row(L"text", text.textString());
}

void listLine(TzDbLine const& line) {
    row(L"from", point(line.startPoint()));
    row(L"to", point(line.endPoint()));
    row(L"length", length(line.startPoint().distanceTo(line.endPoint())));
}

void listCircle(TzDbCircle const& circle) {
    row(L"center", point(circle.center()));
    row(L"radius", length(circle.radius()));
}

void listReference(TzDbBlockReference const& reference) {
    row(L"position", point(reference.position()));
    row(L"scale", TzString::formatted(L"%g", reference.scale()));
}

// Tells about the entity when it is of the class; false when it is not.
template <class Entity>
bool listAs(TzDbEntity const& entity, void (*list)(Entity const&)) {
    auto const* const as = tzrxCast<Entity>(static_cast<TzRxObject const*>(&entity));
    if (as) list(*as);
    return as != nullptr;
}

void listEntity(TzDbEntity const& entity) {
    // "TzDbLine" and so on: the name behind the prefix is the drafter's word.
    std::wstring const name = std::wstring(entity.isA()->name()).substr(4);
    tzutPrintf(L"\n%ls  #%llX, layer \"%ls\"", name.c_str(),
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
