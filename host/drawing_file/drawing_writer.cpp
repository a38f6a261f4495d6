#include "host/base/local_text.h"
#include "host/base/safe_file.h"
#include "host/database/field_imp.h"
#include "host/database/open_state.h"
#include "host/drawing_file/drawing_file.h"
#include "host/drawing_file/members.h"
#include "tz/db/shapes.h"
#include "tz/db/text.h"

namespace tzhost {
namespace drawingfile {
namespace {

// Members that hold the text box in the text's own frame.
void writeBox(MemberWriter& members, LayoutBox const& box) {
    members.nested("measured", [&](MemberWriter& inner) {
        std::string& low = inner.begin("lowerLeft");
        auto const pair = [](std::string& out, double x, double y) {
            out += '[';
            writeNumber(out, x);
            out += ',';
            writeNumber(out, y);
            out += ']';
        };
        pair(low, box.left, box.bottom);
        pair(inner.begin("upperRight"), box.right, box.top);
    });
}

void writeField(MemberWriter& members, TzDbObjectImp const& values) {
    if (!values.fields || values.fields->empty()) return members.null("field");
    TzDbObjectId const field = values.fields->front().second;
    members.text("field", valuesOf<FieldImp>(*field.record()->object).code);
}

enum class Named { asSpace, notAtAll };

class EntityWriter {
public:
    EntityWriter(std::string& out, TzDbObjectRecord const& record)
        : record_(record), object_(*record.object),
          members_(out, TzDbObjectAccess::imp(object_)->unknown.get()) {}

    void write(Named space);

private:
    template <class Imp>
    void own() {
        describe(members_, static_cast<EntityImp&>(valuesOf<Imp>(object_)));
        describeOwn(members_, valuesOf<Imp>(object_));
    }
    template <class Imp>
    void lineText(char const* type, Named space);
    void lines(Named space);
    void insert(Named space);
    void begin(char const* type, Named space);

    TzDbObjectRecord const& record_;
    TzDbObject const& object_;
    MemberWriter members_;
};

void EntityWriter::begin(char const* type, Named space) {
    members_.open();
    members_.text("handle", handleText(record_.handle).str());
    writeText(members_.begin("type"), type);
    if (space == Named::notAtAll) return;
    bool const onPaper = record_.owner == record_.drawing->paperSpace().record();
    writeText(members_.begin("space"), onPaper ? "paper" : "model");
}

template <class Imp>
void EntityWriter::lineText(char const* type, Named space) {
    begin(type, space);
    own<Imp>();
    Imp const& values = valuesOf<Imp>(object_);
    if (values.fields && !values.fields->empty()) writeField(members_, values);
    members_.flag("inWorkingSet", record_.inWorkingSet);
    writeBox(members_, values.box());
}

void EntityWriter::lines(Named space) {
    begin("MTEXT", space);
    own<MTextImp>();
    MTextImp const& values = valuesOf<MTextImp>(object_);
    writeField(members_, values);
    members_.flag("inWorkingSet", record_.inWorkingSet);
    members_.nested("measured", [&](MemberWriter& inner) {
        inner.number("width", values.size().x);
        inner.number("height", values.size().y);
    });
}

void EntityWriter::insert(Named space) {
    begin("INSERT", space);
    InsertImp const& values = valuesOf<InsertImp>(object_);
    describe(members_, static_cast<EntityImp&>(valuesOf<InsertImp>(object_)));
    writeText(members_.begin("block"), recordName(values.block));
    describeOwn(members_, valuesOf<InsertImp>(object_));
    std::string& out = members_.begin("attributes");
    out += '[';
    bool first = true;
    for (TzDbObjectRecord const* const each : values.attributes->items) {
        if (each->erased) continue;
        if (!first) out += ',';
        first = false;
        EntityWriter(out, *each).write(Named::notAtAll);
    }
    out += ']';
    members_.flag("inWorkingSet", record_.inWorkingSet);
}

void EntityWriter::write(Named space) {
    TzRxClass const* const kind = object_.isA();
    if (kind == TzDbMText::desc()) {
        lines(space);
    } else if (kind == TzDbText::desc()) {
        lineText<TextImp>("TEXT", space);
    } else if (kind == TzDbAttributeDefinition::desc()) {
        lineText<DefinitionImp>("ATTDEF", space);
    } else if (kind == TzDbAttribute::desc()) {
        lineText<AttributeImp>("ATTRIB", space);
    } else if (kind == TzDbBlockReference::desc()) {
        insert(space);
    } else {
        bool const isLine = kind == TzDbLine::desc();
        begin(isLine ? "LINE" : "CIRCLE", space);
        isLine ? own<LineImp>() : own<CircleImp>();
        members_.flag("inWorkingSet", record_.inWorkingSet);
    }
    members_.close();
}

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
        if (each->erased) continue;
        out_ += first ? "\n  " : ",\n  ";
        first = false;
        EntityWriter(out_, *each).write(space);
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

bool DrawingWriter::write() {
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
}  // namespace drawingfile

std::string writeDrawing(Drawing& drawing, std::filesystem::path const& file) {
    using namespace drawingfile;
    if (faultStatus("writeDrawing", Tzad::eFileError))
        return file.string() + ": " + localText("cannot be written");
    SafeFile target(file);
    if (target.isOpen() && DrawingWriter(drawing, target).write() && target.commit()) return {};
    return file.string() + ": " + localText("cannot be written") + ": " + target.reason();
}

}  // namespace tzhost
