#include "host/display/view_axes.h"

#include <variant>

#include "host/database/active_space.h"
#include "host/settings/variables.h"
#include "tz/ed/ucs.h"
#include "tz/ge/arbitrary_axis.h"

namespace tzhost {

Space activeSpace() {
    return isPaperActive() ? Space::paper : Space::model;
}

ViewAxes::ViewAxes(TzGeVector3d const& towardsViewer) {
    TzGeMatrix3d const axes = atwt(towardsViewer);
    x_ = axes.xAxis();
    y_ = axes.yAxis();
}

TzGePoint2d ViewAxes::project(TzGePoint3d const& world) const {
    return TzGePoint2d() + project(world.asVector());
}

TzGeVector2d ViewAxes::project(TzGeVector3d const& world) const {
    return {world.dotProduct(x_), world.dotProduct(y_)};
}

ViewAxes viewAxes(Space space) {
    if (space == Space::paper) return ViewAxes();
    VariableValue const* const value = Variables::instance().get(L"VIEWDIR");
    auto const* const direction = value ? std::get_if<VariablePoint>(value) : nullptr;
    if (!direction) return ViewAxes();
    // Without a drawing there is no user system, and the numbers are those of the world.
    VariablePoint world = *direction;
    (void)tzdbUcs2Wcs(direction->data(), world.data(), true);
    return ViewAxes(TzGeVector3d(world[0], world[1], world[2]));
}

}  // namespace tzhost
