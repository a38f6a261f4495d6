#pragma once

#include <set>
#include <string>
#include <vector>

#include "host/drawing_file/entity_reader.h"
#include "host/drawing_file/json_stream.h"
#include "host/drawing_file/page_member.h"
#include "host/drawing_file/table_reader.h"

namespace tzhost::drawingfile {

// Which members a run over the file takes. Entities name layers, styles and blocks; when they come
// before those, a second run over the file reads the entities alone.
enum class Pass { first, entitiesOnly };

// Takes the parts of a drawing as the stream hands them over.
//
//   DrawingReader reader(context);
//   readStream(file, reader);
//   if (reader.needsSecondPass()) { reader.startPass(Pass::entitiesOnly); ... again ... }
//   reader.finish();                       // context.failed says whether the drawing is good
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

    bool member(std::string_view name, JsonValue const& value) override;
    bool beginBlock(int line) override;
    bool blockMember(std::string_view name, JsonValue const& value) override;
    bool endBlock() override;
    bool entity(JsonValue const& value) override;
    void beginArray(std::string_view name) override;

private:
    void readFormat(JsonValue const& value);
    void readVersion(JsonValue const& value);
    // A member that must be an object.
    [[nodiscard]] bool isObject(char const* name, JsonValue const& value);
    void readName(char const* name, JsonValue const& value, std::string& into);
    void refuseTwins();
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
    void variables(JsonValue const& value);
    void ucs(JsonValue const& value) { userSystem("ucs", value, settings_.modelSystem); }
    void paperUcs(JsonValue const& value) { userSystem("paperUcs", value, settings_.paperSystem); }
    void page(JsonValue const& value) { readPage(context_, value, settings_.page); }
    void userSystem(char const* name, JsonValue const& value, UserSystem& system);
    void workingSet(JsonValue const& value);
    void workingAngle(JsonValue const& value);
    void refuseKind(char const* name, JsonValue const& value, JsonKind expected);

    ReadContext& context_;
    EntityReader entities_;
    DrawingSettings settings_;
    Variables::Values variables_;
    std::string layer_;
    std::string style_;
    int layerLine_ = 1;
    int styleLine_ = 1;
    std::set<std::string, std::less<>> seen_;        // members of the drawing
    std::set<std::string, std::less<>> readArrays_;  // those whose entities the first pass took
    Pass pass_ = Pass::first;
    bool readsEntities_ = false;  // of the array that is open
    bool skippedEntities_ = false;
    bool hasFormat_ = false;
    bool hasVersion_ = false;
    bool isNewer_ = false;
    // The block that is open.
    JsonStore blockStore_;  // of its members
    std::vector<JsonMember> blockMembers_;
    int blockLine_ = 1;
    TzDbObjectRecord* block_ = nullptr;  // null outside blocks
    std::size_t blockIndex_ = 0;
    struct ReadBlock {
        TzDbObjectRecord* record;
        int nameLine;
    };
    std::vector<ReadBlock> blocks_;  // by their index in the file
};

}  // namespace tzhost::drawingfile
