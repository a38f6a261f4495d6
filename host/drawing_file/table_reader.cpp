#include "host/drawing_file/table_reader.h"

#include <algorithm>
#include <cmath>
#include <iterator>
#include <memory>
#include <set>

#include "host/database/geometry.h"
#include "host/drawing_file/members.h"
#include "host/text/local_text.h"
#include "host/text/utf8.h"

namespace tzhost::drawingfile {
namespace {

// Lists the records in the order of the file; those that the file lacks come last.
void placeInOrder(TzDbObjectId table, std::vector<TzDbObjectRecord*> order) {
    std::vector<TzDbObjectRecord*>& items = listOf(*table.record())->items;
    std::set<TzDbObjectRecord const*> const inFile(order.begin(), order.end());
    std::copy_if(items.begin(), items.end(), std::back_inserter(order),
                 [&](TzDbObjectRecord const* each) { return !inFile.contains(each); });
    items = std::move(order);
    noteNamesChanged();  // names are found by their records' places
}

// Reads the list of a table, each record by the description of its values.
template <class Record, class Imp>
void readTable(ReadContext& context, JsonValue const& list, char const* name, TzDbObjectId table) {
    if (list.kind != JsonKind::array) {
        return context.complain(list.line, name,
                                localText("is ") + nameOf(list.kind) +
                                    localText(", expected an array"));
    }
    std::set<TzDbObjectRecord const*> seen;
    std::vector<TzDbObjectRecord*> order;
    for (JsonValue const& item : list.items) {
        if (item.kind != JsonKind::object) {
            return context.complain(item.line, name,
                                    localText("holds no object, expected objects"));
        }
        UnknownMembers unknown;
        MemberReader members(context, item, unknown);
        auto fresh = std::make_unique<Record>();
        std::wstring recordName;
        members.text("name", recordName);
        if (!context.failed && recordName.empty()) {
            members.complain("name", localText("is missing or empty, expected a name"));
        }
        TzDbObjectId const found = Drawing::find(table, recordName);
        Imp& values = valuesOf<Imp>(found.isNull() ? *fresh : *found.record()->object);
        values.name = recordName;
        describe(members, values);
        members.keepRest();
        if (!unknown.empty()) values.unknown = std::make_unique<UnknownMembers>(unknown);
        TzDbObjectRecord& record = found.isNull() && !context.failed
                                       ? addTableRecord(context.drawing, table, std::move(fresh))
                                       : *(found.isNull() ? table.record() : found.record());
        if (!seen.insert(&record).second)
            members.complain("name", localText("stands twice, expected each once"));
        if (context.failed) return;
        order.push_back(&record);
    }
    placeInOrder(table, std::move(order));
}

// What a value of that type is called in a message.
char const* nameOfType(VariableType type) {
    switch (type) {
    case VariableType::shortInteger: return forLocalText("a whole number");
    case VariableType::real: return forLocalText("a number");
    case VariableType::text: return forLocalText("a text");
    case VariableType::point: break;
    }
    return forLocalText("an array of three numbers");
}

std::optional<VariableValue> valueFrom(JsonValue const& value, VariableType type) {
    bool const isNumber = value.kind == JsonKind::number && std::isfinite(value.number);
    switch (type) {
    case VariableType::shortInteger:
        if (!isNumber || value.number != std::floor(value.number)) return std::nullopt;
        if (value.number < -32768 || value.number > 32767) return std::nullopt;
        return static_cast<short>(value.number);
    case VariableType::real:
        return isNumber ? std::optional<VariableValue>(value.number) : std::nullopt;
    case VariableType::text:
        if (value.kind != JsonKind::text) return std::nullopt;
        return fromUtf8(value.text);
    case VariableType::point: break;
    }
    if (value.kind != JsonKind::array || value.items.size() != 3) return std::nullopt;
    VariablePoint point{};
    for (std::size_t i = 0; i < point.size(); ++i) {
        JsonValue const& item = value.items[i];
        if (item.kind != JsonKind::number || !std::isfinite(item.number)) return std::nullopt;
        point[i] = item.number;
    }
    return point;
}

void readVariable(ReadContext& context,
                  VariableDefinition const& row,
                  std::string_view name,
                  JsonValue const& member,
                  Variables::Values& values) {
    std::string const path = "variables." + std::string(name);
    auto const value = valueFrom(member, row.type);
    if (!value) {
        return context.complain(member.line, path,
                                localText("is ") + nameOf(member.kind) + localText(", expected ") +
                                    localText(nameOfType(row.type)));
    }
    if (row.complaintAbout(*value)) {
        return context.complain(
            member.line, path, localText("is outside its limits, expected ") + toUtf8(row.takes()));
    }
    values.emplace_back(row.name, *value);
}

void warnLeftOut(ReadContext& context,
                 std::string_view name,
                 JsonValue const& member,
                 std::string const& why) {
    context.warnings.push_back(std::to_string(member.line) + ": " + localText("member \"") +
                               "variables." + std::string(name) + why);
}

}  // namespace

void readLayers(ReadContext& context, JsonValue const& list) {
    readTable<TzDbLayerTableRecord, LayerImp>(context, list, "layers",
                                              context.drawing.layerTableId());
}

void readLinetypes(ReadContext& context, JsonValue const& list) {
    readTable<TzDbLinetypeTableRecord, LinetypeImp>(context, list, "linetypes",
                                                    context.drawing.linetypeTableId());
}

void readTextStyles(ReadContext& context, JsonValue const& list) {
    readTable<TzDbTextStyleTableRecord, TextStyleImp>(context, list, "textStyles",
                                                      context.drawing.textStyleTableId());
}

void readVariables(ReadContext& context, JsonValue const& object, Variables::Values& values) {
    std::set<VariableDefinition const*> seen;
    for (auto const& [name, member] : object.members) {
        VariableDefinition const* const row = findVariable(fromUtf8(name));
        if (row && !seen.insert(row).second) {
            context.complain(member.line, "variables." + std::string(name),
                             localText("stands twice, expected each member once"));
        } else if (!row) {
            std::string json;
            writeValue(json, member);
            context.drawing.unknown.push_back({"variables", std::string(name), std::move(json)});
        } else if (row->kept != KeptIn::drawing) {
            warnLeftOut(context, name, member,
                        localText("\": a drawing does not decide it, left out"));
        } else if (row->name == L"TEXTSTYLE") {
            warnLeftOut(context, name, member, localText("\": currentTextStyle has it, left out"));
        } else {
            readVariable(context, *row, name, member, values);
        }
        if (context.failed) return;
    }
}

void readUserSystem(ReadContext& context,
                    std::string const& name,
                    JsonValue const& object,
                    UserSystem& system) {
    MemberReader members(context, object, context.drawing.unknown, name);
    members.point("origin", system.origin);
    members.direction("x", system.xAxis);
    members.direction("y", system.yAxis);
    members.keepRest();
    constexpr double kSlack = 1e-9;
    if (!system.xAxis.isPerpendicularTo(system.yAxis, TzGeTol(kSlack))) {
        members.complain("y", localText("stands at no right angle to x, expected one that does"));
    }
}

void readWorkingSet(ReadContext& context, JsonValue const& object, DrawingSettings& settings) {
    MemberReader members(context, object, context.drawing.unknown, "workingSet");
    members.flag("exists", settings.workingSetExists);
    members.flag("active", settings.workingSetActive);
    members.keepRest();
}

}  // namespace tzhost::drawingfile
