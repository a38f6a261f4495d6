#include "host/display/shown.h"

#include "host/display/record_access.h"
#include "tz/db/entity.h"
#include "tz/db/symbol_table.h"

namespace tzhost {

bool isOnLayerOff(TzDbEntity const& entity) {
    auto const* const layer = objectOf<TzDbLayerTableRecord>(entity.layerId());
    return layer && layer->isOff();
}

bool isShown(TzDbEntity const& entity) {
    return entity.visibility() == TzDb::kVisible && !isOnLayerOff(entity);
}

}  // namespace tzhost
