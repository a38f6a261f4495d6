#pragma once

#include "tz/ge/matrix3d.h"
#include "tz/ge/point2d.h"

// How the drawing is looked at: orthographically, from a direction. A place in the picture has two
// coordinates, in drawing units: x to the right, y up.
namespace tzhost {

// Which space is seen: the model, or the paper with CVPORT 1 while TILEMODE is 0.
enum class Space { model, paper };

// The space that CVPORT and TILEMODE make the active one.
[[nodiscard]] Space activeSpace();

class ViewAxes {
public:
    // From above.
    ViewAxes() = default;
    // Against a direction in world coordinates; the picture's X axis follows the arbitrary-axis
    // rule, so that up is up unless one looks along the Z axis. A zero direction reads as from
    // above.
    explicit ViewAxes(TzGeVector3d const& towardsViewer);

    [[nodiscard]] TzGePoint2d project(TzGePoint3d const& world) const;
    [[nodiscard]] TzGeVector2d project(TzGeVector3d const& world) const;
    // The vector of the world that lies in the picture plane and projects to `flat`.
    [[nodiscard]] TzGeVector3d unproject(TzGeVector2d const& flat) const {
        return x_ * flat.x + y_ * flat.y;
    }

private:
    TzGeVector3d x_ = TzGeVector3d::kXAxis;
    TzGeVector3d y_ = TzGeVector3d::kYAxis;
};

// The axes that VIEWDIR gives, read in the user system in force, or those of the paper.
[[nodiscard]] ViewAxes viewAxes(Space space);

}  // namespace tzhost
