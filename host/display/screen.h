#pragma once

#include "host/display/view.h"
#include "tz/pal/windows_calls.h"

// The screen, which exists in numbers only, and how the drawing lies on it.
namespace tzhost {

struct PixelSize {
    int width;
    int height;
};

// The application's window fills the desktop; the drawing area stands inside it.
inline constexpr PixelSize kDesktop{1920, 1080};
inline constexpr PixelSize kDrawingArea{1600, 900};
inline constexpr POINT kDrawingAreaCorner{160, 90};

// The mapping that the view in force gives, taken once. Pixels count from the drawing area's top
// left corner, downwards, and are not rounded.
class ScreenMapping {
public:
    explicit ScreenMapping(Space space);

    [[nodiscard]] TzGePoint2d pixelOf(TzGePoint3d const& world) const;
    // In the plane through the middle of the view that faces the viewer.
    [[nodiscard]] TzGePoint3d worldOf(TzGePoint2d const& pixel) const;
    [[nodiscard]] double pixelsPerUnit() const { return pixelsPerUnit_; }

private:
    ViewAxes axes_;
    TzGePoint3d centre_;
    double pixelsPerUnit_;
};

}  // namespace tzhost
