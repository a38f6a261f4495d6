#include "host/base/entity_drawing.h"

namespace tzhost {

bool takenWhole(TzGiCommonDraw* draw,
                TzDbEntity const& entity,
                wchar_t const* type,
                TzGePoint3d const& position) {
    auto* const taker = dynamic_cast<EntityTaker*>(draw);
    return taker && taker->takeEntity(entity, type, position);
}

}  // namespace tzhost
