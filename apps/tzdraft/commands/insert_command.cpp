#include <vector>

#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/choices.h"
#include "apps/tzdraft/commands/placing.h"
#include "apps/tzdraft/commands/problem.h"
#include "apps/tzdraft/commands/record.h"
#include "apps/tzdraft/program_session.h"
#include "apps/tzdraft/program_texts.h"
#include "tz/db/block_table.h"
#include "tz/db/shapes.h"
#include "tz/db/text.h"
#include "tz/ed/print.h"

namespace tzdraft {
namespace {

// An attribute of the reference to be, and what is asked for it.
struct Wanted {
    std::unique_ptr<TzDbAttribute> attribute;
    TzString question;
};

// The value that a definition proposes: of several lines, their markup.
TzString proposedValue(TzDbAttributeDefinition const& definition) {
    TzDbMText const* const lines = definition.getMTextAttributeDefinitionConst();
    return lines ? lines->contents() : definition.textString();
}

Wanted wantedFor(TzDbAttributeDefinition const& definition) {
    Wanted wanted{std::make_unique<TzDbAttribute>(), definition.prompt()};
    if (wanted.question.isEmpty()) wanted.question = definition.tag();
    TzDbAttribute& attribute = *wanted.attribute;
    // The values are those of a text and so are taken.
    (void)attribute.setLayer(definition.layerId());
    (void)attribute.setColor(definition.color());
    (void)attribute.setTextStyle(definition.textStyle());
    (void)attribute.setJustification(definition.justification());
    (void)attribute.setAlignmentPoint(definition.alignmentPoint());
    (void)attribute.setNormal(definition.normal());
    (void)attribute.setRotation(definition.rotation());
    (void)attribute.setHeight(definition.height());
    (void)attribute.setWidthFactor(definition.widthFactor());
    (void)attribute.setOblique(definition.oblique());
    (void)attribute.setTag(definition.tag());
    (void)attribute.setTextString(proposedValue(definition));
    return wanted;
}

std::vector<Wanted> attributesOf(TzDbObjectId block) {
    std::vector<Wanted> all;
    TzArray<TzDbObjectId> ids;
    Opened<TzDbBlockTableRecord> const opened(block, TzDb::kForRead);
    if (opened) opened->entities(ids);
    for (int index = 0; index < ids.length(); ++index) {
        if (ids[index].objectClass() != TzDbAttributeDefinition::desc()) continue;
        Opened<TzDbAttributeDefinition> const definition(ids[index], TzDb::kForRead);
        if (definition) all.push_back(wantedFor(*definition.get()));
    }
    return all;
}

bool askValues(std::vector<Wanted>& all) {
    for (Wanted& each : all) {
        Answer<TzString> const value = askText(each.question, each.attribute->textString());
        if (value.isCancelled()) return false;
        if (value.asked == Asked::given) (void)each.attribute->setTextString(value.value);
    }
    return true;
}

TzDbObjectId blockNamed(TzString const& name) {
    tzhost::Drawing const& drawing = ProgramSession::current().drawing();
    TzDbObjectId const id = tzhost::Drawing::find(drawing.blockTableId(), name.str());
    bool const isSpace = id == drawing.modelSpace() || id == drawing.paperSpace();
    return isSpace ? TzDbObjectId() : id;
}

// Asks where it stands; null after a cancel.
std::unique_ptr<TzDbBlockReference> askReference(TzDbObjectId block) {
    PointAnswer const point = askPoint(localText(L"Insertion point"), nullptr);
    if (point.asked != Asked::given) return nullptr;
    Answer<double> const scale = askLength(localText(L"Scale"), nullptr, 1);
    if (scale.asked != Asked::given) return nullptr;
    Answer<double> const angle = askAngle(localText(L"Rotation angle"), 0);
    if (angle.isCancelled()) return nullptr;
    UserPlane const plane = userPlane();
    auto reference = newEntity<TzDbBlockReference>();
    (void)reference->setBlockTableRecord(block);  // the host gives only values that it takes
    (void)reference->setPosition(toWorld(point.point));
    (void)reference->setNormal(plane.normal);
    (void)reference->setRotation(plane.rotation(angle.value));
    (void)reference->setScale(scale.value);
    return reference;
}

void postWith(std::unique_ptr<TzDbBlockReference> reference, std::vector<Wanted>& attributes) {
    TzGeMatrix3d const placed = reference->blockTransform();
    Opened<TzDbEntity> const posted(postOpen(std::move(reference)));
    if (!posted) return;
    for (Wanted& each : attributes) {
        TzDbObjectId id;
        auto& owner = static_cast<TzDbBlockReference&>(*posted.get());
        if (each.attribute->transformBy(placed) != Tzad::eOk ||
            owner.appendAttribute(id, each.attribute.get()) != Tzad::eOk) {
            continue;
        }
        (void)each.attribute.release()->close();
    }
}

}  // namespace

void insertCommand() {
    TzDbObjectId block;
    Answer<TzString> const name = askUntil(
        [] {
            return askListedName(localText(L"Block to insert or [?]"), offerBlocks(),
                                 ProgramSession::current().drawing().blockTableId());
        },
        [&](Answer<TzString> const& answer) {
            block = blockNamed(answer.value);
            if (block.isNull())
                tellProblem(localText(L"There is no block \"%ls\"."), answer.value.kwszPtr());
            return !block.isNull();
        });
    if (name.asked != Asked::given) return;
    std::unique_ptr<TzDbBlockReference> reference = askReference(block);
    if (!reference) return;
    std::vector<Wanted> attributes = attributesOf(block);
    if (askValues(attributes)) postWith(std::move(reference), attributes);
}

}  // namespace tzdraft
