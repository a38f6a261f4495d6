#include "host/drawing_file/entity_reader.h"

#include <map>
#include <type_traits>

#include "host/database/open_state.h"
#include "host/drawing_file/members.h"
#include "host/fields/field_imp.h"
#include "host/text/local_text.h"
#include "host/text/utf8.h"
#include "tz/db/field.h"
#include "tz/db/shapes.h"
#include "tz/db/text.h"

namespace tzhost::drawingfile {
namespace {

constexpr char const* kTypes = forLocalText("MTEXT, TEXT, ATTDEF, LINE, CIRCLE or INSERT");

// Reading opens every object that it makes; closing it again is no change of a command.
void closeUnchanged(TzDbObjectRecord& record) {
    record.changed = false;
    (void)record.object->close();
}

// The field whose code the file gives; the text that it shows stands in the file too.
void addField(TzDbObjectRecord& owner, std::wstring const& code, std::wstring const& shown) {
    auto field = std::make_unique<TzDbField>();
    FieldImp& values = valuesOf<FieldImp>(*field);
    values.code = code;
    values.shown = shown;
    values.evaluated = true;
    TzDbObjectRecord& added =
        owner.drawing->addObject(field.get(), &owner, Drawing::Numbered::service);
    (void)field.release();  // the drawing's now
    auto& fields = TzDbObjectAccess::imp(*owner.object)->fields;
    fields = std::make_unique<FieldLinks>();
    fields->emplace_back(L"TEXT", TzDbObjectId(&added));
    closeUnchanged(added);
}

// The text that a field of an entity shows; null for entities without texts.
std::wstring const* fieldText(EntityImp const& values) {
    if (auto const* const lines = dynamic_cast<MTextImp const*>(&values)) return &lines->contents;
    if (auto const* const line = dynamic_cast<TextImp const*>(&values)) return &line->text;
    return nullptr;
}

}  // namespace

std::uint64_t EntityReader::handleOf(JsonValue const& value) {
    JsonValue const* const member = value.find("handle");
    if (!member) return 0;
    auto const handle =
        member->kind == JsonKind::text ? readHandle(member->text) : std::optional<std::uint64_t>();
    if (!handle) {
        context_.complain(
            member->line, "handle",
            localText("is no handle, expected a text of hexadecimal digits from \"1\" to "
                      "\"3FFFFFFFFFFFFFFF\""));
        return 0;
    }
    if (!context_.drawing.objectAt(*handle).isNull()) {
        context_.complain(
            member->line, "handle",
            localText("is \"") + std::string(member->text) +
                localText("\" as that of an earlier entity, expected each handle once"));
        return 0;
    }
    return *handle;
}

TzDbObjectRecord& EntityReader::spaceOf(JsonValue const& value) {
    Drawing const& drawing = context_.drawing;
    JsonValue const* const member = value.find("space");
    bool const onPaper = member && member->kind == JsonKind::text && member->text == "paper";
    if (member && !onPaper && (member->kind != JsonKind::text || member->text != "model")) {
        context_.complain(member->line, "space",
                          localText("is no space, expected \"model\" or \"paper\""));
    }
    return *(onPaper ? drawing.paperSpace() : drawing.modelSpace()).record();
}

template <class Entity, class Imp>
void EntityReader::readAs(JsonValue const& value, TzDbObjectRecord& owner) {
    Drawing& drawing = context_.drawing;
    auto entity = std::make_unique<Entity>();
    Imp& values = valuesOf<Imp>(*entity);
    values.layer = Drawing::find(drawing.layerTableId(), L"0");
    if constexpr (std::is_base_of_v<TextStyledImp, Imp>) {
        values.style = Drawing::find(drawing.textStyleTableId(), L"Standard");
    }
    UnknownMembers unknown;
    MemberReader members(context_, value, unknown);
    for (char const* const handled : {"type", "space", "handle", "measured"})
        (void)members.take(handled);
    std::uint64_t const handle = handleOf(value);
    describe(members, static_cast<EntityImp&>(values));
    describeOwn(members, values);
    values.settle(*entity);

    OpenReference reference{nullptr, {}, value.line};
    JsonValue const* attributes = nullptr;
    if constexpr (std::is_same_v<Imp, InsertImp>) {
        members.text("block", reference.block);
        if (JsonValue const* const named = value.find("block")) reference.line = named->line;
        attributes = members.takeOf("attributes", JsonKind::array);
    }
    std::wstring code;
    JsonValue const* const field = fieldText(values) ? members.take("field") : nullptr;
    if (field && field->kind != JsonKind::null) members.text("field", code);
    bool inWorkingSet = true;
    members.flag("inWorkingSet", inWorkingSet);
    members.keepRest();
    if (context_.failed) return;

    if (!unknown.empty()) values.unknown = std::make_unique<UnknownMembers>(std::move(unknown));
    auto const numbered = handle ? Drawing::Numbered::entity : Drawing::Numbered::later;
    TzDbObjectRecord& record = drawing.addObject(entity.get(), &owner, numbered, handle);
    (void)entity.release();  // the drawing's now
    record.inWorkingSet = inWorkingSet;
    if (handle == 0) unnumbered_.push_back(&record);
    if (!code.empty()) addField(record, code, *fieldText(values));
    if constexpr (std::is_same_v<Imp, InsertImp>) {
        reference.reference = &record;
        references_.push_back(std::move(reference));
        readAttributes(attributes, record);
    }
    closeUnchanged(record);
}

void EntityReader::readAttributes(JsonValue const* list, TzDbObjectRecord& reference) {
    if (!list) return;
    for (JsonValue const& each : list->items) {
        JsonValue const* const type = each.find("type");
        if (each.kind != JsonKind::object) {
            context_.complain(each.line, "attributes",
                              localText("holds no object, expected an ATTRIB"));
        } else if (!type || type->text != "ATTRIB") {
            context_.complain(each.line, "type",
                              localText("is missing or another, expected ATTRIB"));
        }
        if (context_.failed) return;
        readAs<TzDbAttribute, AttributeImp>(each, reference);
    }
}

void EntityReader::read(JsonValue const& value, TzDbObjectRecord* owner) {
    if (value.kind != JsonKind::object) {
        return context_.complain(value.line, "entities",
                                 localText("holds ") + nameOf(value.kind) +
                                     localText(", expected an object"));
    }
    struct TypeRow {
        std::string_view name;
        void (EntityReader::*read)(JsonValue const& value, TzDbObjectRecord& owner);
    };
    static constexpr TypeRow kRows[] = {
        {"MTEXT", &EntityReader::readAs<TzDbMText, MTextImp>},
        {"TEXT", &EntityReader::readAs<TzDbText, TextImp>},
        {"ATTDEF", &EntityReader::readAs<TzDbAttributeDefinition, DefinitionImp>},
        {"LINE", &EntityReader::readAs<TzDbLine, LineImp>},
        {"CIRCLE", &EntityReader::readAs<TzDbCircle, CircleImp>},
        {"INSERT", &EntityReader::readAs<TzDbBlockReference, InsertImp>},
    };
    JsonValue const* const type = value.find("type");
    if (!type) {
        return context_.complain(value.line, "type",
                                 localText("is missing, expected ") + localText(kTypes));
    }
    for (TypeRow const& row : kRows) {
        if (type->kind != JsonKind::text || type->text != row.name) continue;
        return (this->*row.read)(value, owner ? *owner : spaceOf(value));
    }
    std::string const found =
        type->kind == JsonKind::text ? '"' + std::string(type->text) + '"' : nameOf(type->kind);
    context_.complain(type->line, "type",
                      localText("is ") + found + localText(", expected ") + localText(kTypes));
}

void EntityReader::refuseCycles() {
    enum class Mark { open, done };
    std::map<TzDbObjectRecord const*, std::vector<OpenReference const*>> inside;
    for (OpenReference const& each : references_)
        inside[each.reference->owner].push_back(&each);
    struct Visit {
        TzDbObjectRecord const* block;
        std::size_t next;
    };
    std::map<TzDbObjectRecord const*, Mark> marks;
    for (OpenReference const& each : references_) {
        TzDbObjectRecord const* const start = each.reference->owner;
        if (!marks.emplace(start, Mark::open).second) continue;
        std::vector<Visit> path{{start, 0}};
        while (!path.empty()) {
            auto& [block, next] = path.back();
            auto const at = inside.find(block);
            if (at == inside.end() || next == at->second.size()) {
                marks[block] = Mark::done;
                path.pop_back();
                continue;
            }
            OpenReference const& reference = *at->second[next++];
            TzDbObjectRecord const* const target =
                valuesOf<InsertImp>(*reference.reference->object).block.record();
            auto const mark = marks.find(target);
            if (mark != marks.end() && mark->second == Mark::open) {
                return context_.complain(
                    reference.line, "block",
                    localText("leads back to the block that holds it, expected another"));
            }
            if (mark != marks.end()) continue;
            marks.emplace(target, Mark::open);
            path.push_back({target, 0});
        }
    }
}

void EntityReader::finish() {
    for (OpenReference const& each : references_) {
        TzDbObjectId const block = Drawing::find(context_.drawing.blockTableId(), each.block);
        if (block.isNull()) {
            return context_.complain(
                each.line, "block",
                localText("names \"") + toUtf8(each.block) +
                    localText("\", expected the name of a block of this drawing"));
        }
        valuesOf<InsertImp>(*each.reference->object).block = block;
    }
    refuseCycles();
    for (TzDbObjectRecord* const record : unnumbered_)
        context_.drawing.numberObject(*record);
}

}  // namespace tzhost::drawingfile
