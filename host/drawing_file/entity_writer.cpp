#include "host/drawing_file/entity_writer.h"

#include <algorithm>
#include <cmath>
#include <initializer_list>

#include "host/database/open_state.h"
#include "host/drawing_file/members.h"
#include "host/fields/field_imp.h"
#include "tz/db/shapes.h"
#include "tz/db/text.h"

namespace tzhost::drawingfile {
namespace {

bool areFinite(std::initializer_list<double> numbers) {
    return std::all_of(numbers.begin(), numbers.end(),
                       [](double each) { return std::isfinite(each); });
}

// Members that hold the text box in the text's own frame. A text of a size that no number holds
// goes without, so that what is written can be read.
void writeBox(MemberWriter& members, LayoutBox const& box) {
    if (!areFinite({box.left, box.bottom, box.right, box.top})) return;
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
    LayoutPoint const size = values.size();
    if (!areFinite({size.x, size.y})) return;
    members_.nested("measured", [&](MemberWriter& inner) {
        inner.number("width", size.x);
        inner.number("height", size.y);
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

}  // namespace

void writeEntity(std::string& out, TzDbObjectRecord const& entity, Named space) {
    EntityWriter(out, entity).write(space);
}

}  // namespace tzhost::drawingfile
