#include "host/display/screen.h"

#include <cmath>
#include <variant>

#include "host/base/variables.h"
#include "tz/ed/view.h"

// Windows are told apart by their addresses.
struct TzWindow {
    POINT corner;
    tzhost::PixelSize size;
};

namespace tzhost {
namespace {

constexpr TzWindow kDesktopWindow{
    {0, 0},
    kDesktop
};
constexpr TzWindow kApplicationWindow{
    {0, 0},
    kDesktop
};
constexpr TzWindow kDrawingAreaWindow{kDrawingAreaCorner, kDrawingArea};

// Half of what a pixel's coordinate can hold, so that the area's corner can be added.
constexpr double kFarthestPixel = 1073741824.0;

TzGePoint3d viewCentre(Space space) {
    VariableValue const* const value = Variables::instance().get(L"VIEWCTR");
    auto const* const point = value ? std::get_if<VariablePoint>(value) : nullptr;
    if (!point) return TzGePoint3d::kOrigin;
    return {(*point)[0], (*point)[1], space == Space::paper ? 0.0 : (*point)[2]};
}

// What a viewport shows: number 1 is the paper, but where spaces are tiled each shows the model.
Space spaceOf(int viewport) {
    bool const tiled = Variables::instance().number(L"TILEMODE") != 0;
    return viewport == 1 && !tiled ? Space::paper : Space::model;
}

}  // namespace

ScreenMapping::ScreenMapping(Space space)
    : axes_(viewAxes(space)), centre_(viewCentre(space)),
      pixelsPerUnit_(kDrawingArea.height / Variables::instance().number(L"VIEWSIZE")) {}

TzGePoint2d ScreenMapping::pixelOf(TzGePoint3d const& world) const {
    TzGeVector2d const off = axes_.project(world - centre_) * pixelsPerUnit_;
    return {kDrawingArea.width / 2.0 + off.x, kDrawingArea.height / 2.0 - off.y};
}

TzGePoint3d ScreenMapping::worldOf(TzGePoint2d const& pixel) const {
    TzGeVector2d const off(pixel.x - kDrawingArea.width / 2.0, kDrawingArea.height / 2.0 - pixel.y);
    return centre_ + axes_.unproject(off / pixelsPerUnit_);
}

}  // namespace tzhost

HWND GetDesktopWindow() {
    return &tzhost::kDesktopWindow;
}

HWND GetApplicationWindow() {
    return &tzhost::kApplicationWindow;
}

HWND GetDrawingAreaWindow() {
    return &tzhost::kDrawingAreaWindow;
}

int GetWindowRect(HWND window, RECT* rect) {
    if (!window || !rect) return 0;
    POINT const corner = window->corner;
    *rect = {corner.x, corner.y, corner.x + window->size.width, corner.y + window->size.height};
    return 1;
}

int ClientToScreen(HWND window, POINT* point) {
    if (!window || !point) return 0;
    point->x += window->corner.x;
    point->y += window->corner.y;
    return 1;
}

bool tzedCoordFromWorldToPixel(int viewport, TzGePoint3d const& world, POINT& pixel) {
    if (viewport < 1) return false;
    tzhost::ScreenMapping const mapping(tzhost::spaceOf(viewport));
    TzGePoint2d const exact = mapping.pixelOf(world);
    // Written so that what is not a number fails as well.
    bool const fits = std::fabs(exact.x) <= tzhost::kFarthestPixel &&
                      std::fabs(exact.y) <= tzhost::kFarthestPixel;
    if (!fits) return false;
    pixel.x = static_cast<std::int32_t>(std::lround(exact.x));
    pixel.y = static_cast<std::int32_t>(std::lround(exact.y));
    return true;
}

bool tzedCoordFromPixelToWorld(int viewport, POINT const& pixel, TzGePoint3d& world) {
    if (viewport < 1) return false;
    tzhost::ScreenMapping const mapping(tzhost::spaceOf(viewport));
    world = mapping.worldOf({static_cast<double>(pixel.x), static_cast<double>(pixel.y)});
    return true;
}
