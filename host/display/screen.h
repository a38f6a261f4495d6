#pragma once

#include "host/display/view_axes.h"

// How the drawing lies on the screen, which exists in numbers only.
namespace tzhost {

// The mapping that the view in force gives, taken once. Pixels count from the drawing area's top
// left corner, downwards, and are not rounded.
class ScreenMapping {
public:
    explicit ScreenMapping(Space space);

    [[nodiscard]] TzGePoint2d pixelOf(TzGePoint3d const& world) const;
    // In the plane through the middle of the view that faces the viewer.
    [[nodiscard]] TzGePoint3d worldOf(TzGePoint2d const& pixel) const;

private:
    ViewAxes axes_;
    TzGePoint3d centre_;
    TzGePoint2d middle_;  // the pixel that shows the centre
    double pixelsPerUnit_;
};

}  // namespace tzhost
