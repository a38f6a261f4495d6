#pragma once

#include <variant>
#include <vector>

#include "tz/db/object_id.h"
#include "tz/ge/point3d.h"
#include "tz/gi/color.h"
#include "tz/gi/text_style.h"
#include "tz/text/string.h"

// What was drawn, stroke by stroke, in the order in which it was drawn. Both back ends start here:
// a frame of a drag is this list written down, a plot is this list painted. Nothing is merged or
// left out. Points are world coordinates.
namespace tzhost {

// How a stroke looks. A colour as the block means that of the block reference around it, which
// stands beside it; so do the layers, for colours as the layer.
struct DrawPen {
    TzCmEntityColor color;
    TzCmEntityColor blockColor;
    TzDbObjectId layer;
    TzDbObjectId blockLayer;
    TzDbObjectId linetype;  // null draws solid
    int lineWeight = 0;     // hundredths of a millimetre
    int fill = 0;
    TzCmTransparency transparency;
};

struct DrawnLines {
    std::vector<TzGePoint3d> points;
    bool closed = false;  // an outline, which a fill type above 0 fills
};

// A line of text with the left end of its baseline at `position`.
struct DrawnText {
    TzString text;
    TzGePoint3d position;
    TzGeVector3d normal;
    TzGeVector3d direction;
    TzGiTextStyle style;
    bool raw = true;
};

// An entity that the list took whole.
struct DrawnEntity {
    TzString type;
    TzGePoint3d position;
};

struct DrawOp {
    DrawPen pen;
    std::variant<DrawnLines, DrawnText, DrawnEntity> what;
};

using DrawList = std::vector<DrawOp>;

}  // namespace tzhost
