#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/placing.h"
#include "apps/tzdraft/program_texts.h"
#include "tz/db/shapes.h"

namespace tzdraft {
void lineCommand() {
    PointAnswer from = askPoint(localText(L"First point"), nullptr);
    while (from.asked == Asked::given) {
        PointAnswer const to = askPoint(localText(L"Next point"), &from.point);
        if (to.asked != Asked::given) return;
        auto line = newEntity<TzDbLine>();
        (void)line->setStartPoint(toWorld(from.point));  // the host takes only finite points
        (void)line->setEndPoint(toWorld(to.point));
        post(std::move(line));
        from = to;
    }
}

}  // namespace tzdraft
