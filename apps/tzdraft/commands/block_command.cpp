#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/choices.h"
#include "apps/tzdraft/commands/placing.h"
#include "apps/tzdraft/commands/problem.h"
#include "apps/tzdraft/commands/record.h"
#include "apps/tzdraft/commands/selected.h"
#include "apps/tzdraft/program_session.h"
#include "apps/tzdraft/program_texts.h"
#include "host/database/user_system.h"
#include "tz/db/block_table.h"
#include "tz/db/field.h"
#include "tz/db/shapes.h"
#include "tz/db/text.h"
#include "tz/ed/print.h"

namespace tzdraft {
namespace {

// An entity on its way into a block, which a failure on the way deletes.
using Copy = std::unique_ptr<TzDbEntity>;

Copy cloned(TzDbEntity const& entity) {
    return Copy(static_cast<TzDbEntity*>(entity.clone()));
}

// A reference without its attributes, which each reference has of its own.
Copy withoutAttributes(TzDbBlockReference const& reference) {
    auto copy = std::make_unique<TzDbBlockReference>();
    // The values are those of an entity and so are taken.
    (void)copy->setLayer(reference.layerId());
    (void)copy->setColor(reference.color());
    (void)copy->setVisibility(reference.visibility());
    (void)copy->setBlockTableRecord(reference.blockTableRecord());
    (void)copy->setPosition(reference.position());
    (void)copy->setNormal(reference.normal());
    (void)copy->setRotation(reference.rotation());
    (void)copy->setScale(reference.scale());
    return copy;
}

// A copy has the text of the original alone; the code that the text comes from goes with it too.
void copyField(TzDbEntity const& from, TzDbEntity& to) {
    TzDbField* found = nullptr;
    if (from.getField(L"TEXT", found, TzDb::kForRead) != Tzad::eOk) return;
    Opened<TzDbField> const original(found);
    auto copy = std::make_unique<TzDbField>();
    TzDbObjectId id;
    if (copy->setFieldCode(original->getFieldCode(0), 0, nullptr) != Tzad::eOk) return;
    if (to.setField(L"TEXT", copy.get(), id) == Tzad::eOk) (void)copy.release()->close();
}

void copyAttributes(TzDbBlockReference const& from,
                    TzDbBlockReference& to,
                    TzGeMatrix3d const& toBlock) {
    TzArray<TzDbObjectId> ids;
    from.attributes(ids);
    for (int index = 0; index < ids.length(); ++index) {
        Opened<TzDbAttribute> const attribute(ids[index], TzDb::kForRead);
        if (!attribute) continue;
        Copy copy = cloned(*attribute.get());
        TzDbObjectId id;
        if (!copy || copy->transformBy(toBlock) != Tzad::eOk) continue;
        if (to.appendAttribute(id, static_cast<TzDbAttribute*>(copy.get())) != Tzad::eOk) continue;
        Opened<TzDbEntity> const added(copy.release());
        copyField(*attribute.get(), *added.get());
    }
}

// Puts a copy of the entity into the block; false when it cannot be there.
bool copyInto(TzDbBlockTableRecord& block, TzDbEntity const& entity, TzGeMatrix3d const& toBlock) {
    auto const* const reference =
        tzrxCast<TzDbBlockReference>(static_cast<TzRxObject const*>(&entity));
    Copy copy = reference ? withoutAttributes(*reference) : cloned(entity);
    TzDbObjectId id;
    if (!copy || copy->transformBy(toBlock) != Tzad::eOk) return false;
    if (block.appendTzDbEntity(id, copy.get()) != Tzad::eOk) return false;
    Opened<TzDbEntity> const added(copy.release());
    copyField(entity, *added.get());
    if (reference)
        copyAttributes(*reference, static_cast<TzDbBlockReference&>(*added.get()), toBlock);
    return true;
}

// A new block of that name; the null id when the name is taken or no name of a block.
TzDbObjectId newBlock(TzString const& name) {
    TzDbBlockTable* table = nullptr;
    if (ProgramSession::current().drawing().getBlockTable(table, TzDb::kForWrite) != Tzad::eOk)
        return {};
    Opened<TzDbBlockTable> const opened(table);
    if (table->has(name)) return {};
    return findOrAdd<TzDbBlockTableRecord>(table, name);
}

// Blocks keep their entities in the axes of the user system that they were made in.
void moveInto(TzDbObjectId id, std::vector<TzDbObjectId> const& entities, TzGePoint3d const& base) {
    Opened<TzDbBlockTableRecord> const block(id, TzDb::kForWrite);
    if (!block) return;
    (void)block->setOrigin(base);  // a point that was answered is finite
    TzGeMatrix3d const toBlock = tzhost::currentUserSystem().matrix().inverse();
    for (TzDbObjectId const each : entities) {
        Opened<TzDbEntity> const entity(each, TzDb::kForWrite);
        if (entity && copyInto(*block.get(), *entity.get(), toBlock)) (void)entity->erase();
    }
}

}  // namespace

void blockCommand() {
    Answer<TzString> const name = askName(localText(L"Name of the new block"), offerBlocks());
    if (name.asked != Asked::given) return;
    PointAnswer const base = askPoint(localText(L"Base point"), nullptr);
    if (base.asked != Asked::given) return;
    std::vector<TzDbObjectId> const entities = selectEntities(OnLockedLayers::leftOut);
    if (entities.empty()) return;
    TzDbObjectId const block = newBlock(name.value);
    if (block.isNull()) {
        tellProblem(localText(L"\"%ls\" cannot be the name of a new block."), name.value.kwszPtr());
        return;
    }
    moveInto(block, entities, base.point);
}

}  // namespace tzdraft
