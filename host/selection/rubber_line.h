#pragma once

#include <vector>

#include "tz/db/entity.h"
#include "tz/ge/point3d.h"
#include "tz/gi/draw.h"

namespace tzhost {

// The line that a drag of a selection shows; world coordinates.
class RubberLine final : public TzDbEntity {
public:
    std::vector<TzGePoint3d> points;

protected:
    bool subWorldDraw(TzGiWorldDraw* draw) override {
        if (draw) draw->geometry().polyline(static_cast<int>(points.size()), points.data());
        return true;
    }
};

// The cursor's form in such a drag (TzEdJig::setSpecialCursorType).
constexpr int kRubberBand = 2;

}  // namespace tzhost
