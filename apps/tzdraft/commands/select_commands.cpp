#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/record.h"
#include "apps/tzdraft/commands/selected.h"
#include "apps/tzdraft/commands/selection_set.h"
#include "tz/db/entity.h"

namespace tzdraft {

void selectCommand() {
    SelectionSet set;
    bool const hasAny = set.select(L"");
    (void)tzedSSSetFirst(hasAny ? set.name() : nullptr, hasAny ? set.name() : nullptr);
}

void eraseCommand() {
    for (TzDbObjectId const id : selectEntities(OnLockedLayers::leftOut)) {
        Opened<TzDbEntity> const entity(id, TzDb::kForWrite);
        if (entity) (void)entity->erase();  // open for write: not refused but by a fault plan
    }
}

}  // namespace tzdraft
