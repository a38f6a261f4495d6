#include "module/uncalled/align_direction.h"

TzGePoint3d TzMTextAlignDirection::referencePoint(TzGeBoundBlock3d const& /*box*/) {
    return TzGePoint3d::kOrigin;
}

double TzMTextAlignDirection::distanceBetweenReferencePoints() {
    return 0.0;
}
