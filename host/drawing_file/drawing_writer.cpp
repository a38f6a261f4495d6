#include "host/drawing_file/drawing_writer.h"

#include "host/base/job.h"
#include "host/drawing_file/entity_writer.h"
#include "host/drawing_file/members.h"
#include "host/drawing_file/page_member.h"
#include "host/text/local_text.h"

namespace tzhost::drawingfile {
namespace {

// Writes the whole drawing; the text is handed to the file whenever it has grown.
class DrawingWriter {
public:
    DrawingWriter(Drawing& drawing, SafeFile& file)
        : drawing_(drawing), file_(file), members_(out_, &drawing.unknown) {}

    [[nodiscard]] bool write();

private:
    void header();
    void variables();
    void userSystem(char const* name, UserSystem const& system);
    template <class Imp>
    void table(char const* name, TzDbObjectId table);
    void blocks();
    [[nodiscard]] std::size_t countEntities() const;
    void entities(TzDbObjectId block, Named space, bool& first);
    [[nodiscard]] bool flush();

    Drawing& drawing_;
    SafeFile& file_;
    std::string out_;
    MemberWriter members_;
    bool good_ = true;
};

void DrawingWriter::header() {
    members_.open();
    writeText(members_.begin("format"), "tz-drawing");
    members_.number("version", 1);
    members_.breakLines();
    variables();
    DrawingSettings const& settings = drawing_.settings();
    userSystem("ucs", settings.modelSystem);
    userSystem("paperUcs", settings.paperSystem);
    if (settings.page) writePage(members_, *settings.page);
    table<LayerImp>("layers", drawing_.layerTableId());
    writeText(members_.begin("currentLayer"), recordName(settings.layer));
    table<LinetypeImp>("linetypes", drawing_.linetypeTableId());
    table<TextStyleImp>("textStyles", drawing_.textStyleTableId());
    writeText(members_.begin("currentTextStyle"), recordName(settings.textStyle));
}

// The style in force stands beside the styles, not among the variables.
void DrawingWriter::variables() {
    members_.nested("variables", [](MemberWriter& inner) {
        for (auto const& [name, value] : Variables::instance().kept(KeptIn::drawing)) {
            if (name == L"TEXTSTYLE") continue;
            std::string const key(name.begin(), name.end());
            if (auto const* const whole = std::get_if<short>(&value)) {
                inner.number(key.c_str(), *whole);
            } else if (auto const* const real = std::get_if<double>(&value)) {
                inner.number(key.c_str(), *real);
            } else if (auto const* const text = std::get_if<std::wstring>(&value)) {
                inner.text(key.c_str(), *text);
            } else {
                auto const& [x, y, z] = std::get<VariablePoint>(value);
                inner.point(key.c_str(), {x, y, z});
            }
        }
    });
}

void DrawingWriter::userSystem(char const* name, UserSystem const& system) {
    members_.nested(name, [&](MemberWriter& inner) {
        inner.point("origin", system.origin);
        inner.direction("x", system.xAxis);
        inner.direction("y", system.yAxis);
    });
}

template <class Imp>
void DrawingWriter::table(char const* name, TzDbObjectId table) {
    members_.begin(name) += '[';
    bool first = true;
    for (TzDbObjectRecord const* const each : listOf(*table.record())->items) {
        if (each->erased) continue;
        out_ += first ? "\n  " : ",\n  ";
        first = false;
        Imp& values = valuesOf<Imp>(*each->object);
        MemberWriter members(out_, values.unknown.get());
        members.open();
        members.text("name", values.name);
        describe(members, values);
        members.close();
    }
    out_ += ']';
}

void DrawingWriter::entities(TzDbObjectId block, Named space, bool& first) {
    for (TzDbObjectRecord const* const each :
         valuesOf<BlockImp>(*block.record()->object).entities->items) {
        Job::step();
        if (each->erased) continue;
        out_ += first ? "\n  " : ",\n  ";
        first = false;
        writeEntity(out_, *each, space);
        good_ = good_ && flush();
        if (!good_) return;
    }
}

void DrawingWriter::blocks() {
    members_.begin("blocks") += '[';
    bool firstBlock = true;
    for (TzDbObjectRecord* const each : listOf(*drawing_.blockTableId().record())->items) {
        TzDbObjectId const id(each);
        if (each->erased || id == drawing_.modelSpace() || id == drawing_.paperSpace()) continue;
        out_ += firstBlock ? "\n  " : ",\n  ";
        firstBlock = false;
        BlockImp& values = valuesOf<BlockImp>(*each->object);
        MemberWriter members(out_, values.unknown.get());
        members.open();
        members.text("name", values.name);
        describe(members, values);
        members.begin("entities") += '[';
        bool first = true;
        entities(id, Named::notAtAll, first);
        out_ += ']';
        members.close();
    }
    out_ += ']';
}

bool DrawingWriter::flush() {
    constexpr std::size_t kBlockSize = std::size_t{1} << 16;
    if (out_.size() < kBlockSize) return true;
    bool const written = file_.write(out_);
    out_.clear();
    return written;
}

// Those of blocks, too, and erased ones, which are passed over.
std::size_t DrawingWriter::countEntities() const {
    std::size_t count = 0;
    for (TzDbObjectRecord const* const each : listOf(*drawing_.blockTableId().record())->items)
        count += valuesOf<BlockImp>(*each->object).entities->items.size();
    return count;
}

bool DrawingWriter::write() {
    Job const job(localText(L"Saving"), countEntities());
    header();
    blocks();
    members_.begin("entities") += '[';
    bool first = true;
    entities(drawing_.modelSpace(), Named::asSpace, first);
    entities(drawing_.paperSpace(), Named::asSpace, first);
    out_ += ']';
    DrawingSettings const& settings = drawing_.settings();
    members_.nested("workingSet", [&](MemberWriter& inner) {
        inner.flag("exists", settings.workingSetExists);
        inner.flag("active", settings.workingSetActive);
    });
    members_.number("workingAngle", settings.workingAngle);
    members_.close();
    out_ += '\n';
    return good_ && file_.write(out_);
}

}  // namespace

bool writeWhole(Drawing& drawing, SafeFile& file) {
    return DrawingWriter(drawing, file).write();
}

}  // namespace tzhost::drawingfile
