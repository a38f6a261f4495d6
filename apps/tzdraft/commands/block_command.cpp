#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/choices.h"
#include "apps/tzdraft/commands/copying.h"
#include "apps/tzdraft/commands/placing.h"
#include "apps/tzdraft/commands/problem.h"
#include "apps/tzdraft/commands/record.h"
#include "apps/tzdraft/commands/selected.h"
#include "apps/tzdraft/program_session.h"
#include "apps/tzdraft/program_texts.h"
#include "host/database/symbol_name.h"
#include "host/database/user_system.h"
#include "tz/db/block_table.h"
#include "tz/ed/print.h"

namespace tzdraft {
namespace {

// A new block of a name that is free.
TzDbObjectId newBlock(TzString const& name) {
    TzDbBlockTable* table = nullptr;
    if (ProgramSession::current().drawing().getBlockTable(table, TzDb::kForWrite) != Tzad::eOk)
        return {};
    Opened<TzDbBlockTable> const opened(table);
    return findOrAdd<TzDbBlockTableRecord>(table, name);
}

// A name that a new block can have.
bool isFree(Answer<TzString> const& name) {
    tzhost::Drawing const& drawing = ProgramSession::current().drawing();
    bool const isTaken = !tzhost::Drawing::find(drawing.blockTableId(), name.value.str()).isNull();
    if (isTaken) {
        tellProblem(localText(L"There is a block \"%ls\" already."), name.value.kwszPtr());
    } else if (!tzhost::isSymbolName(name.value.str())) {
        tellNoName(localText(L"\"%ls\" cannot be the name of a new block."), name.value);
    } else {
        return true;
    }
    return false;
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
    Answer<TzString> const name = askUntil(
        [] { return askName(localText(L"Name of the new block"), offerBlocks()); }, isFree);
    if (name.asked != Asked::given) return;
    PointAnswer const base = askPoint(localText(L"Base point"), nullptr);
    if (base.asked != Asked::given) return;
    std::vector<TzDbObjectId> const entities = selectEntities(OnLockedLayers::leftOut);
    if (entities.empty()) return;
    if (TzDbObjectId const block = newBlock(name.value); !block.isNull())
        moveInto(block, entities, base.point);
}

}  // namespace tzdraft
