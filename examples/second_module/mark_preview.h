#pragma once

#include "tz/db/entity.h"
#include "tz/ge/point3d.h"
#include "tz/ge/vector3d.h"
#include "tz/text/string.h"

namespace marks {

// A mark as numbers: a circle with a number in it, and a line from the circle to what it points at.
// World coordinates, drawing units.
struct Mark {
    TzGePoint3d target;
    TzGePoint3d centre;
    TzGeVector3d normal = TzGeVector3d::kZAxis;
    TzGeVector3d direction = TzGeVector3d::kXAxis;  // of the number
    double radius = 1;
    TzString number;

    // Where the line leaves the circle: the centre itself when the target lies in it.
    [[nodiscard]] TzGePoint3d lineStart() const;
    [[nodiscard]] bool hasLine() const;
};

// Shows a mark while it is dragged. It is in no database.
class MarkPreview : public TzDbEntity {
public:
    Mark mark;

    static void registerClass();
    static void unregisterClass();
    [[nodiscard]] TzRxClass* isA() const override;

protected:
    bool subWorldDraw(TzGiWorldDraw* draw) override;

private:
    static TzRxClass* descriptor_;
};

}  // namespace marks
