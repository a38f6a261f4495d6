#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/problem.h"
#include "apps/tzdraft/program_session.h"
#include "apps/tzdraft/program_texts.h"
#include "host/database/user_system.h"
#include "tz/ed/print.h"
#include "tz/ed/ucs.h"
#include "tz/ge/matrix3d.h"

namespace tzdraft {
namespace {

TzGeMatrix3d present() {
    TzGeMatrix3d system;
    (void)tzedGetCurrentUCS(system);  // the identity without a drawing
    return system;
}

void makeCurrent(TzGeMatrix3d const& system) {
    tzhost::UserSystem user;
    TzGeVector3d zAxis;
    system.getCoordSystem(user.origin, user.xAxis, user.yAxis, zAxis);
    if (!tzhost::setUserSystem(user)) tellProblem(localText(L"That is no coordinate system."));
}

// Makes a system that is given in the present one current, for good.
void use(TzGeMatrix3d const& inPresent) {
    makeCurrent(present() * inPresent);
}

void turn(TzGeVector3d const& axis) {
    Answer<double> const angle = askAngle(localText(L"Rotation angle"), 0);
    if (angle.asked == Asked::given)
        use(TzGeMatrix3d::rotation(angle.value, axis, TzGePoint3d::kOrigin));
}

void turnX() {
    turn(TzGeVector3d::kXAxis);
}
void turnY() {
    turn(TzGeVector3d::kYAxis);
}
void turnZ() {
    turn(TzGeVector3d::kZAxis);
}

void world() {
    makeCurrent(TzGeMatrix3d());
}

void threePoints() {
    PointAnswer const origin = askPoint(localText(L"New origin"), nullptr);
    if (origin.asked != Asked::given) return;
    TzGeVector3d x;
    auto const isAxis = [&](PointAnswer const& answer) {
        x = answer.point - origin.point;
        if (x.isZeroLength()) tellProblem(localText(L"That is the origin itself."));
        return !x.isZeroLength();
    };
    PointAnswer const onX = askUntil(
        [&] { return askPoint(localText(L"Point on the positive X axis"), &origin.point); },
        isAxis);
    if (onX.asked != Asked::given) return;
    TzGeVector3d z;
    auto const isBeside = [&](PointAnswer const& answer) {
        z = x.crossProduct(answer.point - origin.point);
        if (z.isZeroLength()) tellProblem(localText(L"The three points lie on one line."));
        return !z.isZeroLength();
    };
    PointAnswer const towardsY = askUntil(
        [&] {
            return askPoint(localText(L"Point on the side of the positive Y axis"), &origin.point);
        },
        isBeside);
    if (towardsY.asked != Asked::given) return;
    x.normalize();
    z.normalize();
    TzGeMatrix3d system;
    system.setCoordSystem(origin.point, x, z.crossProduct(x), z);
    use(system);
}

struct Choice {
    wchar_t const* word;
    void (*action)();
};

constexpr wchar_t const* kWords = forLocalText(L"World X Y Z 3Point");
constexpr Choice kChoices[] = {
    {L"World", world}, {L"X", turnX}, {L"Y", turnY}, {L"Z", turnZ}, {L"3Point", threePoints},
};

}  // namespace

void ucsCommand() {
    PointAnswer const answer =
        askPoint(localText(L"Origin of the user system or"), nullptr, kWords, L"World");
    if (answer.asked == Asked::cancelled) return;
    if (answer.asked == Asked::empty) return world();
    if (answer.word.isEmpty()) return use(TzGeMatrix3d::translation(answer.point.asVector()));
    for (Choice const& each : kChoices) {
        if (answer.word == each.word) return each.action();
    }
}

}  // namespace tzdraft
