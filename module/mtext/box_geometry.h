#pragma once

#include <array>

#include "module/geometry/user_axes.h"
#include "tz/ge/point3d.h"
#include "tz/ge/vector3d.h"

// The text box that is dragged between two corners, as pure geometry. World coordinates, drawing
// units.
//
// With vertical text the same four points are used in turned roles: the text runs down along the
// frame's x axis, and its lines follow each other against the y axis.

// Which way the lines of the text run.
enum class LineFlow { horizontal, vertical };

// Named as they stand in the turned frame once the drag has left the first point.
struct BoxCorners {
    TzGePoint3d topLeft;
    TzGePoint3d bottomLeft;
    TzGePoint3d topRight;
    TzGePoint3d bottomRight;
};

// One edge of the box, in the order in which it is drawn.
struct BoxEdge {
    TzGePoint3d from;
    TzGePoint3d to;
};
struct BoxEdges {
    std::array<BoxEdge, 2> sides;
    BoxEdge top;
    BoxEdge bottom;
};

// Lays the box between a base point and a point, which is projected on the base point's plane. The
// corners are named by where they stand, in whatever direction the drag goes; while both points are
// equal they keep their names. A corner that cannot be found stays as it was.
void stretchBox(BoxCorners& corners,
                TzGePoint3d const& base,
                TzGePoint3d const& point,
                UserAxes const& frame);

// Where a text of an attachment point (1 to 9; any other counts as 1) is to be placed. `width` and
// `height` run along the frame's axes and are as long as the box.
[[nodiscard]] TzGePoint3d attachmentPoint(BoxCorners const& corners,
                                          TzGeVector3d const& width,
                                          TzGeVector3d const& height,
                                          int attachment);

[[nodiscard]] BoxEdges edgesOf(BoxCorners const& corners, LineFlow flow);

// The outline of the arrow that shows in which direction the text grows past an open edge: it lies
// on the inner side of the edge from a to b and points at it. `size` is the width of its head. The
// outline is closed: its last point is its first.
[[nodiscard]] std::array<TzGePoint3d, 8>
arrowOutline(BoxEdge const& edge, UserAxes const& frame, LineFlow flow, double size);

// Where the sample text in the box begins. `textSize` is the height of the text, `textWidth` its
// width.
[[nodiscard]] TzGePoint3d samplePosition(BoxCorners const& corners,
                                         UserAxes const& frame,
                                         LineFlow flow,
                                         int attachment,
                                         double textSize,
                                         double textWidth);
