#include "host/display/screen.h"

#include <cmath>
#include <variant>

#include "host/base/fault_point.h"
#include "host/platform/desktop.h"
#include "host/settings/variables.h"
#include "tz/ed/view.h"

namespace tzhost {
namespace {

// Half of what a pixel's coordinate can hold, so that the drawing area's corner can be added.
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

ScreenMapping::ScreenMapping(Space space) : axes_(viewAxes(space)), centre_(viewCentre(space)) {
    RECT const& area = screen().drawingArea;
    double const height = area.bottom - area.top;
    middle_ = {(area.right - area.left) / 2.0, height / 2.0};
    pixelsPerUnit_ = height / Variables::instance().number(L"VIEWSIZE");
}

TzGePoint2d ScreenMapping::pixelOf(TzGePoint3d const& world) const {
    TzGeVector2d const off = axes_.project(world - centre_) * pixelsPerUnit_;
    return {middle_.x + off.x, middle_.y - off.y};
}

TzGePoint3d ScreenMapping::worldOf(TzGePoint2d const& pixel) const {
    TzGeVector2d const off(pixel.x - middle_.x, middle_.y - pixel.y);
    return centre_ + axes_.unproject(off / pixelsPerUnit_);
}

}  // namespace tzhost

bool tzedCoordFromWorldToPixel(int viewport, TzGePoint3d const& world, POINT& pixel) {
    if (tzhost::faultAt("tzedCoordFromWorldToPixel") || viewport < 1) return false;
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
    if (tzhost::faultAt("tzedCoordFromPixelToWorld") || viewport < 1) return false;
    tzhost::ScreenMapping const mapping(tzhost::spaceOf(viewport));
    world = mapping.worldOf({static_cast<double>(pixel.x), static_cast<double>(pixel.y)});
    return true;
}
