#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/record.h"
#include "apps/tzdraft/commands/selected.h"
#include "apps/tzdraft/commands/selection_set.h"
#include "apps/tzdraft/program_texts.h"
#include "host/base/job.h"
#include "tz/db/entity.h"

namespace tzdraft {

void selectCommand() {
    SelectionSet set;
    bool const hasAny = set.select(L"");
    (void)tzedSSSetFirst(hasAny ? set.name() : nullptr, hasAny ? set.name() : nullptr);
}

void eraseCommand() {
    std::vector<TzDbObjectId> const ids = selectEntities(OnLockedLayers::leftOut);
    tzhost::Job const job(localText(L"Erasing"), ids.size());
    for (TzDbObjectId const id : ids) {
        tzhost::Job::step();
        Opened<TzDbEntity> const entity(id, TzDb::kForWrite);
        if (entity) (void)entity->erase();  // open for write: not refused but by a fault plan
    }
}

}  // namespace tzdraft
