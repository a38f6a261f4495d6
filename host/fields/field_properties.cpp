#include "host/fields/field_properties.h"

#include "host/database/classes.h"
#include "host/database/open_state.h"
#include "host/database/symbol_imp.h"
#include "host/settings/variables.h"
#include "tz/db/mtext.h"
#include "tz/db/shapes.h"
#include "tz/db/text.h"

namespace tzhost {
namespace {

using Value = std::optional<std::wstring>;

std::wstring pointText(TzGePoint3d const& point) {
    return writeReal(point.x) + L',' + writeReal(point.y) + L',' + writeReal(point.z);
}

std::wstring nameOf(TzDbObjectId id) {
    return id.isNull() ? std::wstring() : valuesOf<SymbolImp>(*id.record()->object).name;
}

// The value that `read` takes from an entity of class T; nothing for another class.
template <class T, class Read>
Value from(TzDbObject const& object, Read const& read) {
    T const* const typed = tzrxCast<T>(&object);
    return typed ? Value(read(*typed)) : std::nullopt;
}

struct PropertyRow {
    wchar_t const* name;
    Value (*read)(TzDbObject const& object);
};

// Names may stand twice, for several classes; the first row with a value counts.
constexpr PropertyRow kProperties[] = {
    {L"type", [](TzDbObject const& o) -> Value { return entityKind(o.isA()).str(); }},
    {L"handle",
     [](TzDbObject const& o) -> Value { return handleText(o.objectId().handle()).str(); }},
    {L"layer",
     [](TzDbObject const& o) {
         return from<TzDbEntity>(o, [](auto const& e) { return e.layer().str(); });
     }},
    {L"contents",
     [](TzDbObject const& o) {
         return from<TzDbMText>(o, [](auto const& e) { return e.contents().str(); });
     }},
    {L"text",
     [](TzDbObject const& o) {
         return from<TzDbText>(o, [](auto const& e) { return e.textString().str(); });
     }},
    {L"tag",
     [](TzDbObject const& o) {
         return from<TzDbAttribute>(o, [](auto const& e) { return e.tag().str(); });
     }},
    {L"tag",
     [](TzDbObject const& o) {
         return from<TzDbAttributeDefinition>(o, [](auto const& e) { return e.tag().str(); });
     }},
    {L"style",
     [](TzDbObject const& o) {
         return from<TzDbMText>(o, [](auto const& e) { return nameOf(e.textStyle()); });
     }},
    {L"style",
     [](TzDbObject const& o) {
         return from<TzDbText>(o, [](auto const& e) { return nameOf(e.textStyle()); });
     }},
    {L"textHeight",
     [](TzDbObject const& o) {
         return from<TzDbMText>(o, [](auto const& e) { return writeReal(e.textHeight()); });
     }},
    {L"textHeight",
     [](TzDbObject const& o) {
         return from<TzDbText>(o, [](auto const& e) { return writeReal(e.height()); });
     }},
    {L"width",
     [](TzDbObject const& o) {
         return from<TzDbMText>(o, [](auto const& e) { return writeReal(e.width()); });
     }},
    {L"location",
     [](TzDbObject const& o) {
         return from<TzDbMText>(o, [](auto const& e) { return pointText(e.location()); });
     }},
    {L"position",
     [](TzDbObject const& o) {
         return from<TzDbText>(o, [](auto const& e) { return pointText(e.position()); });
     }},
    {L"position",
     [](TzDbObject const& o) {
         return from<TzDbBlockReference>(o, [](auto const& e) { return pointText(e.position()); });
     }},
    {L"block",
     [](TzDbObject const& o) {
         return from<TzDbBlockReference>(
             o, [](auto const& e) { return nameOf(e.blockTableRecord()); });
     }},
    {L"start",
     [](TzDbObject const& o) {
         return from<TzDbLine>(o, [](auto const& e) { return pointText(e.startPoint()); });
     }},
    {L"end",
     [](TzDbObject const& o) {
         return from<TzDbLine>(o, [](auto const& e) { return pointText(e.endPoint()); });
     }},
    {L"length",
     [](TzDbObject const& o) {
         return from<TzDbLine>(
             o, [](auto const& e) { return writeReal(e.startPoint().distanceTo(e.endPoint())); });
     }},
    {L"center",
     [](TzDbObject const& o) {
         return from<TzDbCircle>(o, [](auto const& e) { return pointText(e.center()); });
     }},
    {L"radius",
     [](TzDbObject const& o) {
         return from<TzDbCircle>(o, [](auto const& e) { return writeReal(e.radius()); });
     }},
};

}  // namespace

std::optional<std::wstring> propertyText(TzDbObject const& object, std::wstring_view name) {
    std::wstring const wanted(name);
    for (PropertyRow const& row : kProperties) {
        if (tzCompareNoCase(row.name, wanted.c_str()) != 0) continue;
        if (Value value = row.read(object)) return value;
    }
    return std::nullopt;
}

}  // namespace tzhost
