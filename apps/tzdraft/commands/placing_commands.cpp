// MOVE, COPY and ROTATE: a base point, and a drag that says where the entities go.

#include <algorithm>
#include <cmath>
#include <optional>

#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/copying.h"
#include "apps/tzdraft/commands/placing.h"
#include "apps/tzdraft/commands/placing_drag.h"
#include "apps/tzdraft/commands/problem.h"
#include "apps/tzdraft/commands/record.h"
#include "apps/tzdraft/commands/selected.h"
#include "apps/tzdraft/program_session.h"
#include "apps/tzdraft/program_texts.h"
#include "host/base/job.h"
#include "host/command_line/command_line.h"
#include "host/command_line/point_input.h"
#include "host/database/user_system.h"

namespace tzdraft {
namespace {

using Entities = std::vector<TzDbObjectId>;

// What goes, and from where in world coordinates. Nothing when nothing is selected or a question
// is cancelled.
struct Chosen {
    Entities entities;
    TzGePoint3d base;
};

std::optional<Chosen> choose() {
    Chosen chosen{selectEntities(OnLockedLayers::leftOut), {}};
    if (chosen.entities.empty()) return std::nullopt;
    PointAnswer const base = askPoint(localText(L"Base point"), nullptr);
    if (base.asked != Asked::given) return std::nullopt;
    chosen.base = toWorld(base.point);
    return chosen;
}

// An entity cannot be where its coordinates would not be finite.
void tellStaying(std::ptrdiff_t count) {
    if (count > 0)
        tellProblem(localText(L"Objects that cannot be there: %d."), static_cast<int>(count));
}

void moveAll(Entities const& entities, TzGeMatrix3d const& placed) {
    tzhost::Job const job(localText(L"Moving"), entities.size());
    tellStaying(std::count_if(entities.begin(), entities.end(), [&](TzDbObjectId id) {
        tzhost::Job::step();
        Opened<TzDbEntity> const entity(id, TzDb::kForWrite);
        return !entity || entity->transformBy(placed) != Tzad::eOk;
    }));
}

void copyAll(Entities const& entities, std::vector<TzGeMatrix3d> const& places) {
    Opened<TzDbBlockTableRecord> const space(ProgramSession::current().drawing().activeSpace(),
                                             TzDb::kForWrite);
    if (!space) return;
    std::ptrdiff_t staying = 0;
    tzhost::Job const job(localText(L"Copying"), entities.size() * places.size());
    for (TzGeMatrix3d const& placed : places) {
        staying += std::count_if(entities.begin(), entities.end(), [&](TzDbObjectId id) {
            tzhost::Job::step();
            Opened<TzDbEntity> const entity(id, TzDb::kForRead);
            return !entity || !copyInto(*space.get(), *entity.get(), placed);
        });
    }
    tellStaying(staying);
}

PlacingDrag::Placing movedFrom(TzGePoint3d const& base) {
    return [=](TzGePoint3d const& to) { return TzGeMatrix3d::translation(to - base); };
}

// Turns about the Z axis of the user system.
TzGeMatrix3d turned(TzGePoint3d const& base, double radians) {
    return TzGeMatrix3d::rotation(radians, userPlane().normal, base);
}

// Of the point seen from the base point; 0 for the base point itself.
double angleOf(TzGePoint3d const& to, TzGePoint3d const& base) {
    tzhost::UserSystem const system = tzhost::currentUserSystem();
    TzGeVector3d const arm = to - base;
    return std::atan2(arm.dotProduct(system.yAxis), arm.dotProduct(system.xAxis));
}

PlacingDrag::Placing turnedAbout(TzGePoint3d const& base) {
    return [=](TzGePoint3d const& to) { return turned(base, angleOf(to, base)); };
}

// The angle that was typed instead of a point; asks again for what is none.
std::optional<TzGeMatrix3d> askTurn(PlacingDrag& drag, TzGePoint3d const& base) {
    for (;;) {
        int const status =
            drag.ask(localText(L"Rotation angle, or a point"), PlacingDrag::Takes::otherAnswers);
        if (status == TzEdJig::kNormal) {
            // What the point came to, which a person has not typed. A script is not told.
            if (tzhost::commandLine().isPerson())
                tzhost::commandLine().say(tzhost::shownAngle(angleOf(drag.cursor(), base)).str());
            return drag.placed();
        }
        if (status != TzEdJig::kString) return std::nullopt;
        std::wstring const typed = tzhost::commandLine().takeInput().value_or(L"");
        if (auto const radians = tzhost::readAngle(typed)) return turned(base, *radians);
        tzhost::commandLine().sayProblem(localText(L"An angle is needed, or a point."));
    }
}

}  // namespace

void moveCommand() {
    std::optional<Chosen> const chosen = choose();
    if (!chosen) return;
    PlacingDrag drag(chosen->entities, chosen->base, movedFrom(chosen->base));
    if (drag.ask(localText(L"Second point")) != TzEdJig::kNormal) return;
    moveAll(chosen->entities, drag.placed());
}

// The copies are made at the end, so that a cancel leaves none.
void copyCommand() {
    std::optional<Chosen> const chosen = choose();
    if (!chosen) return;
    PlacingDrag drag(chosen->entities, chosen->base, movedFrom(chosen->base));
    int status = TzEdJig::kNormal;
    while (status == TzEdJig::kNormal) {
        status = drag.ask(localText(L"Second point, or Enter to end"));
        if (status == TzEdJig::kNormal) drag.keep();
    }
    if (status == TzEdJig::kNull) copyAll(chosen->entities, drag.kept());
}

void rotateCommand() {
    std::optional<Chosen> const chosen = choose();
    if (!chosen) return;
    PlacingDrag drag(chosen->entities, chosen->base, turnedAbout(chosen->base));
    if (auto const placed = askTurn(drag, chosen->base)) moveAll(chosen->entities, *placed);
}

}  // namespace tzdraft
