#pragma once

#include "tz/ge/bound_block3d.h"

// A direction of an alignment that does not align: it knows no point of a text and no distance.
// Nothing calls it; what a justification means stands in module/align/spacing/text_direction.h.
class TzMTextAlignDirection {
public:
    // The world's origin, whatever the box.
    [[nodiscard]] static TzGePoint3d referencePoint(TzGeBoundBlock3d const& box);
    [[nodiscard]] static double distanceBetweenReferencePoints();
};
