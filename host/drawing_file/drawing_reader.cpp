#include <cerrno>
#include <cstdio>
#include <set>

#include "host/base/file_bytes.h"
#include "host/base/local_text.h"
#include "host/base/utf8.h"
#include "host/drawing_file/drawing_file.h"
#include "host/drawing_file/entity_reader.h"
#include "host/drawing_file/json_stream.h"
#include "host/drawing_file/members.h"
#include "host/drawing_file/table_reader.h"

namespace tzhost {
namespace drawingfile {
namespace {

constexpr int kVersion = 1;

// Which members a run over the file takes. Entities name layers, styles and blocks; when they come
// ahead of those, a second run over the file reads the entities alone.
enum class Pass { first, entitiesOnly };

class DrawingReader final : public DrawingSink {
public:
    explicit DrawingReader(ReadContext& context)
        : context_(context), entities_(context), settings_(context.drawing.settings()) {}

    void startPass(Pass pass) { pass_ = pass; }
    [[nodiscard]] bool needsSecondPass() const { return skippedEntities_; }
    [[nodiscard]] bool isNewer() const { return isNewer_; }
    [[nodiscard]] Variables::Values takeVariables() { return std::move(variables_); }
    // Everything was read.
    void finish();

    bool member(std::string const& name, JsonValue value) override;
    bool beginBlock(int line) override;
    bool blockMember(std::string const& name, JsonValue value) override;
    bool endBlock() override;
    bool entity(JsonValue value) override;
    void beginArray(std::string const& name) override;

private:
    void readFormat(JsonValue const& value);
    void readVersion(JsonValue const& value);
    // A member that must be an object.
    [[nodiscard]] bool isObject(char const* name, JsonValue const& value);
    void readName(char const* name, JsonValue const& value, std::string& into);
    [[nodiscard]] TzDbObjectId currentRecord(char const* name,
                                             std::string const& wanted,
                                             TzDbObjectId table,
                                             TzDbObjectId fallback);

    struct MemberRow {
        char const* name;
        void (DrawingReader::*read)(JsonValue const& value);
    };
    static MemberRow const kRows[];
    void layers(JsonValue const& value) { readLayers(context_, value); }
    void linetypes(JsonValue const& value) { readLinetypes(context_, value); }
    void textStyles(JsonValue const& value) { readTextStyles(context_, value); }
    void currentLayer(JsonValue const& value) { readName("currentLayer", value, layer_); }
    void currentTextStyle(JsonValue const& value) { readName("currentTextStyle", value, style_); }
    void variables(JsonValue const& value) {
        if (isObject("variables", value)) readVariables(context_, value, variables_);
    }
    void ucs(JsonValue const& value) {
        if (isObject("ucs", value)) readUserSystem(context_, "ucs", value, settings_.modelSystem);
    }
    void paperUcs(JsonValue const& value) {
        if (isObject("paperUcs", value)) {
            readUserSystem(context_, "paperUcs", value, settings_.paperSystem);
        }
    }
    void workingSet(JsonValue const& value) {
        if (isObject("workingSet", value)) readWorkingSet(context_, value, settings_);
    }
    void workingAngle(JsonValue const& value) {
        if (value.kind == JsonKind::number) {
            settings_.workingAngle = value.number;
        } else {
            wrongKind("workingAngle", value, nameOf(JsonKind::number));
        }
    }
    void wrongKind(char const* name, JsonValue const& value, std::string const& expected) {
        context_.complain(value.line, name,
                          localText("is ") + nameOf(value.kind) + localText(", expected ") +
                              expected);
    }

    ReadContext& context_;
    EntityReader entities_;
    DrawingSettings settings_;
    Variables::Values variables_;
    std::string layer_;
    std::string style_;
    int layerLine_ = 1;
    int styleLine_ = 1;
    std::set<std::string> seen_;
    Pass pass_ = Pass::first;
    bool readsEntities_ = false;  // of the array that is open
    bool skippedEntities_ = false;
    bool hasFormat_ = false;
    bool hasVersion_ = false;
    bool isNewer_ = false;
    // The block that is open.
    JsonValue blockValue_;
    TzDbObjectRecord* block_ = nullptr;  // null outside blocks
    std::size_t blockIndex_ = 0;
    std::vector<TzDbObjectRecord*> blocks_;  // by their index in the file
};

DrawingReader::MemberRow const DrawingReader::kRows[] = {
    {"format",           &DrawingReader::readFormat      },
    {"version",          &DrawingReader::readVersion     },
    {"variables",        &DrawingReader::variables       },
    {"ucs",              &DrawingReader::ucs             },
    {"paperUcs",         &DrawingReader::paperUcs        },
    {"layers",           &DrawingReader::layers          },
    {"currentLayer",     &DrawingReader::currentLayer    },
    {"linetypes",        &DrawingReader::linetypes       },
    {"textStyles",       &DrawingReader::textStyles      },
    {"currentTextStyle", &DrawingReader::currentTextStyle},
    {"workingSet",       &DrawingReader::workingSet      },
    {"workingAngle",     &DrawingReader::workingAngle    },
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
                      isNewer_ ? localText("is ") + value.text +
                                     localText(" and newer than this program, expected 1")
                               : localText("is no version, expected 1"));
}

bool DrawingReader::isObject(char const* name, JsonValue const& value) {
    if (value.kind != JsonKind::object) wrongKind(name, value, nameOf(JsonKind::object));
    return value.kind == JsonKind::object;
}

void DrawingReader::readName(char const* name, JsonValue const& value, std::string& into) {
    if (value.kind != JsonKind::text) return wrongKind(name, value, nameOf(JsonKind::text));
    into = value.text;
    (&into == &layer_ ? layerLine_ : styleLine_) = value.line;
}

bool DrawingReader::member(std::string const& name, JsonValue value) {
    if (pass_ == Pass::entitiesOnly) return true;
    seen_.insert(name);
    for (MemberRow const& row : kRows) {
        if (name != row.name) continue;
        (this->*row.read)(value);
        return !context_.failed;
    }
    std::string json;
    writeValue(json, value);
    context_.drawing.unknown.push_back({"", name, std::move(json)});
    return true;
}

// Blocks need their layers and styles, entities of the drawing need the blocks too.
void DrawingReader::beginArray(std::string const& name) {
    bool const hasTables = seen_.contains("layers") && seen_.contains("textStyles");
    if (pass_ == Pass::first) {
        readsEntities_ = hasTables;
        skippedEntities_ = skippedEntities_ || !readsEntities_;
        if (readsEntities_) seen_.insert(name + " read");
    } else {
        readsEntities_ = !seen_.contains(name + " read");
    }
    blockIndex_ = 0;
}

bool DrawingReader::beginBlock(int line) {
    blockValue_ = JsonValue();
    blockValue_.kind = JsonKind::object;
    blockValue_.line = line;
    if (pass_ == Pass::entitiesOnly) {
        block_ = blocks_[blockIndex_++];
        return true;
    }
    block_ = &addTableRecord(context_.drawing, context_.drawing.blockTableId(),
                             std::make_unique<TzDbBlockTableRecord>());
    blocks_.push_back(block_);
    return true;
}

bool DrawingReader::blockMember(std::string const& name, JsonValue value) {
    blockValue_.members.push_back({name, std::move(value)});
    return true;
}

bool DrawingReader::endBlock() {
    TzDbObjectRecord* const record = std::exchange(block_, nullptr);
    if (pass_ == Pass::entitiesOnly) return true;
    BlockImp& values = valuesOf<BlockImp>(*record->object);
    UnknownMembers unknown;
    MemberReader members(context_, blockValue_, unknown);
    std::wstring name;
    members.text("name", name);
    describe(members, values);
    members.keepRest();
    if (!context_.failed && name.empty()) {
        members.complain("name", localText("is missing or empty, expected a name"));
    }
    if (!Drawing::find(context_.drawing.blockTableId(), name).isNull() && !name.empty()) {
        members.complain("name", localText("stands twice, expected each once"));
    }
    values.name = std::move(name);
    noteNamesChanged();
    if (!unknown.empty()) values.unknown = std::make_unique<UnknownMembers>(std::move(unknown));
    return !context_.failed;
}

bool DrawingReader::entity(JsonValue value) {
    if (!readsEntities_) return true;
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

void DrawingReader::finish() {
    if (!hasFormat_)
        context_.complain(1, "format", localText("is missing, expected \"tz-drawing\""));
    if (!hasVersion_) context_.complain(1, "version", localText("is missing, expected 1"));
    if (context_.failed) return;
    entities_.finish();
    Drawing& drawing = context_.drawing;
    settings_.layer =
        currentRecord("currentLayer", layer_, drawing.layerTableId(), settings_.layer);
    settings_.textStyle =
        currentRecord("currentTextStyle", style_, drawing.textStyleTableId(), settings_.textStyle);
    if (!context_.failed) drawing.restoreSettings(settings_);
}

std::string messageOf(std::filesystem::path const& file, Problem const& problem) {
    std::string text = file.string() + ':' + std::to_string(problem.line) + ": ";
    text += problem.member.empty() ? localText("the drawing")
                                   : localText("member \"") + problem.member + '"';
    return text + (problem.member.empty() ? " " : ": ") + problem.what;
}

// Runs over the file; false when something is wrong, which `context` then holds.
bool runOver(std::FILE* file, DrawingReader& reader, ReadContext& context) {
    std::rewind(file);
    StreamResult const result = readStream(file, reader);
    if (result.failed) {
        context.complain(result.problem.line, result.problem.member, result.problem.what);
    }
    return !context.failed;
}

struct FileCloser {
    void operator()(std::FILE* file) const { (void)std::fclose(file); }  // only read from
};

}  // namespace
}  // namespace drawingfile

DrawingRead readDrawing(std::filesystem::path const& file) {
    using namespace drawingfile;
    DrawingRead result;
    if (faultStatus("readDrawing", Tzad::eFileError)) {
        result.error = file.string() + ": " + localText("cannot be read");
        return result;
    }
    std::error_code ignored;
    bool const isFolder = std::filesystem::is_directory(file, ignored);
    if (isFolder) errno = EISDIR;
    std::unique_ptr<std::FILE, FileCloser> const stream(isFolder ? nullptr
                                                                 : std::fopen(file.c_str(), "rb"));
    if (!stream) {
        result.error = file.string() + ": " + localText("cannot be read") + ": " + systemReason();
        return result;
    }
    auto drawing = Drawing::create();
    ReadContext context{*drawing, false, {}, {}};
    DrawingReader reader(context);
    bool good = runOver(stream.get(), reader, context);
    if (good && reader.needsSecondPass()) {
        reader.startPass(Pass::entitiesOnly);
        good = runOver(stream.get(), reader, context);
    }
    if (good) reader.finish();
    for (std::string const& warning : context.warnings)
        result.warnings.push_back(file.string() + ':' + warning);
    result.isNewer = reader.isNewer();
    if (context.failed) {
        result.error = messageOf(file, context.problem);
        return result;
    }
    result.variables = reader.takeVariables();
    drawing->setFile(file);
    result.drawing = std::move(drawing);
    return result;
}

void setKeptVariables(Variables::Values const& values) {
    Variables& store = Variables::instance();
    store.resetKept(KeptIn::drawing);
    for (auto const& [name, value] : values)
        (void)store.setKept(name, value);  // checked when they were read
}

}  // namespace tzhost
