#include "host/selection/entities_where.h"

#include "host/base/job.h"
#include "host/database/drawing.h"
#include "host/selection/box_index.h"
#include "host/text/local_text.h"

namespace tzhost {

EntityIds entitiesWhere(FlatBox const& box,
                        std::function<bool(Outline const& outline)> const& takes) {
    EntityIds found;
    Drawing const* const drawing = workingDrawing();
    if (drawing == nullptr) return found;
    Job const job(localText(L"Selecting"));
    TzDbObjectRecord const* const space = drawing->activeSpace().record();
    for (TzDbObjectRecord* const record : itemsNear(space, TzGeMatrix3d::kIdentity, box)) {
        TzDbObjectId const id(record);
        TzDbEntity* const entity = entityOf(id);
        if (entity != nullptr && takes(Outline::of(*entity))) found.append(id);
    }
    return found;
}

}  // namespace tzhost
