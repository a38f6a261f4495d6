#include "host/drawing_file/drawing_reader.h"

#include <utility>

#include "host/base/job.h"
#include "host/drawing_file/members.h"
#include "host/text/local_text.h"
#include "host/text/utf8.h"

namespace tzhost::drawingfile {
namespace {

constexpr int kVersion = 1;

}  // namespace

DrawingReader::MemberRow const DrawingReader::kRows[] = {
    {"format", &DrawingReader::readFormat},
    {"version", &DrawingReader::readVersion},
    {"variables", &DrawingReader::variables},
    {"ucs", &DrawingReader::ucs},
    {"paperUcs", &DrawingReader::paperUcs},
    {"page", &DrawingReader::page},
    {"layers", &DrawingReader::layers},
    {"currentLayer", &DrawingReader::currentLayer},
    {"linetypes", &DrawingReader::linetypes},
    {"textStyles", &DrawingReader::textStyles},
    {"currentTextStyle", &DrawingReader::currentTextStyle},
    {"workingSet", &DrawingReader::workingSet},
    {"workingAngle", &DrawingReader::workingAngle},
};

void DrawingReader::readFormat(JsonValue const& value) {
    hasFormat_ = true;
    if (value.kind != JsonKind::text || value.text != "tz-drawing") {
        context_.complain(value.line, "format", localText("is another, expected \"tz-drawing\""));
    }
}

void DrawingReader::readVersion(JsonValue const& value) {
    hasVersion_ = true;
    if (value.kind == JsonKind::number && value.number == kVersion) return;
    isNewer_ = value.kind == JsonKind::number && value.number > kVersion;
    context_.complain(value.line, "version",
                      isNewer_ ? localText("is ") + std::string(value.text) +
                                     localText(" and newer than this program, expected 1")
                               : localText("is no version, expected 1"));
}

void DrawingReader::variables(JsonValue const& value) {
    if (isObject("variables", value)) readVariables(context_, value, variables_);
}

void DrawingReader::userSystem(char const* name, JsonValue const& value, UserSystem& system) {
    if (isObject(name, value)) readUserSystem(context_, name, value, system);
}

void DrawingReader::workingSet(JsonValue const& value) {
    if (isObject("workingSet", value)) readWorkingSet(context_, value, settings_);
}

void DrawingReader::workingAngle(JsonValue const& value) {
    if (value.kind != JsonKind::number) return refuseKind("workingAngle", value, JsonKind::number);
    settings_.workingAngle = value.number;
}

void DrawingReader::refuseKind(char const* name, JsonValue const& value, JsonKind expected) {
    context_.complain(value.line, name,
                      localText("is ") + nameOf(value.kind) + localText(", expected ") +
                          nameOf(expected));
}

bool DrawingReader::isObject(char const* name, JsonValue const& value) {
    if (value.kind != JsonKind::object) refuseKind(name, value, JsonKind::object);
    return value.kind == JsonKind::object;
}

void DrawingReader::readName(char const* name, JsonValue const& value, std::string& into) {
    if (value.kind != JsonKind::text) return refuseKind(name, value, JsonKind::text);
    into = value.text;
    (&into == &layer_ ? layerLine_ : styleLine_) = value.line;
}

bool DrawingReader::member(std::string_view name, JsonValue const& value) {
    if (pass_ == Pass::entitiesOnly) return true;
    seen_.emplace(name);
    for (MemberRow const& row : kRows) {
        if (name != row.name) continue;
        (this->*row.read)(value);
        return !context_.failed;
    }
    std::string json;
    writeValue(json, value);
    context_.drawing.unknown.push_back({"", std::string(name), std::move(json)});
    return true;
}

// Blocks need their layers and styles, entities of the drawing need the blocks too.
void DrawingReader::beginArray(std::string_view name) {
    bool const hasTables = seen_.contains("layers") && seen_.contains("textStyles");
    if (pass_ == Pass::first) {
        readsEntities_ = hasTables;
        skippedEntities_ = skippedEntities_ || !readsEntities_;
        if (readsEntities_) readArrays_.emplace(name);
    } else {
        readsEntities_ = !readArrays_.contains(name);
    }
    blockIndex_ = 0;
}

bool DrawingReader::beginBlock(int line) {
    blockMembers_.clear();
    blockStore_.clear();
    blockLine_ = line;
    if (pass_ == Pass::entitiesOnly) {
        if (blockIndex_ < blocks_.size())
            block_ = blocks_[blockIndex_++].record;
        else
            context_.complain(line, "blocks", localText("has changed while it was read"));
        return !context_.failed;
    }
    block_ = &addTableRecord(context_.drawing, context_.drawing.blockTableId(),
                             std::make_unique<TzDbBlockTableRecord>());
    blocks_.push_back({block_, line});
    return true;
}

bool DrawingReader::blockMember(std::string_view name, JsonValue const& value) {
    blockMembers_.push_back({blockStore_.keep(name), blockStore_.keep(value)});
    return true;
}

bool DrawingReader::endBlock() {
    TzDbObjectRecord* const record = std::exchange(block_, nullptr);
    if (pass_ == Pass::entitiesOnly) return true;
    BlockImp& values = valuesOf<BlockImp>(*record->object);
    JsonValue value;
    value.kind = JsonKind::object;
    value.line = blockLine_;
    value.members = {blockMembers_.data(), blockMembers_.size()};
    UnknownMembers unknown;
    MemberReader members(context_, value, unknown);
    std::wstring name;
    members.text("name", name);
    describe(members, values);
    members.keepRest();
    if (!context_.failed && name.empty()) {
        members.complain("name", localText("is missing or empty, expected a name"));
    }
    values.name = std::move(name);
    if (JsonValue const* const named = value.find("name")) {
        blocks_.back().nameLine = named->line;
    }
    if (!unknown.empty()) values.unknown = std::make_unique<UnknownMembers>(std::move(unknown));
    return !context_.failed;
}

bool DrawingReader::entity(JsonValue const& value) {
    if (!readsEntities_) return true;
    Job::step();
    entities_.read(value, block_);
    return !context_.failed;
}

TzDbObjectId DrawingReader::currentRecord(char const* name,
                                          std::string const& wanted,
                                          TzDbObjectId table,
                                          TzDbObjectId fallback) {
    if (wanted.empty()) return fallback;
    TzDbObjectId const found = Drawing::find(table, fromUtf8(wanted));
    if (found.isNull()) {
        context_.complain(name == std::string_view("currentLayer") ? layerLine_ : styleLine_, name,
                          localText("names \"") + wanted +
                              localText("\", expected a name that the drawing has"));
    }
    return found;
}

// Blocks are listed before their names are known, so their names are compared at the end.
void DrawingReader::refuseTwins() {
    noteNamesChanged();
    for (ReadBlock const& each : blocks_) {
        std::wstring const& name = valuesOf<BlockImp>(*each.record->object).name;
        if (Drawing::find(context_.drawing.blockTableId(), name).record() == each.record) continue;
        return context_.complain(each.nameLine, "name",
                                 localText("stands twice, expected each once"));
    }
}

void DrawingReader::finish() {
    if (!hasFormat_)
        context_.complain(1, "format", localText("is missing, expected \"tz-drawing\""));
    if (!hasVersion_) context_.complain(1, "version", localText("is missing, expected 1"));
    if (!context_.failed) refuseTwins();
    if (context_.failed) return;
    entities_.finish();
    Drawing& drawing = context_.drawing;
    settings_.layer =
        currentRecord("currentLayer", layer_, drawing.layerTableId(), settings_.layer);
    settings_.textStyle =
        currentRecord("currentTextStyle", style_, drawing.textStyleTableId(), settings_.textStyle);
    if (!context_.failed) drawing.restoreSettings(settings_);
}

}  // namespace tzhost::drawingfile
