#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/placing.h"
#include "apps/tzdraft/program_texts.h"
#include "tz/db/shapes.h"

namespace tzdraft {

void circleCommand() {
    PointAnswer const center = askPoint(localText(L"Center point"), nullptr);
    if (center.asked != Asked::given) return;
    Answer<double> const radius = askLength(localText(L"Radius"), &center.point);
    if (radius.asked != Asked::given) return;
    auto circle = newEntity<TzDbCircle>();
    (void)circle->setCenter(toWorld(center.point));  // the host takes only finite points
    (void)circle->setNormal(userPlane().normal);
    (void)circle->setRadius(radius.value);
    post(std::move(circle));
}

}  // namespace tzdraft
