#include "host/database/user_system.h"

#include <new>
#include <utility>
#include <vector>

#include "host/base/audit.h"
#include "host/base/event_sink.h"
#include "host/base/memory_faults.h"
#include "host/database/geometry.h"
#include "host/settings/variables.h"
#include "tz/db/host_services.h"
#include "tz/ed/ucs.h"
#include "tz/ge/matrix3d.h"

namespace tzhost {
namespace {

// A system that waits to be restored, the space that it belongs to, and VIEWDIR in that system and
// in the one that followed.
struct Remembered {
    long long drawing;
    TzDbObjectId space;
    UserSystem system;
    VariablePoint view;
    VariablePoint turnedView;
};

std::vector<Remembered>& stack() {
    static std::vector<Remembered> remembered;
    return remembered;
}

UserSystem systemOf(Drawing const& drawing, TzDbObjectId space) {
    DrawingSettings const& settings = drawing.settings();
    return space == drawing.paperSpace() ? settings.paperSystem : settings.modelSystem;
}

VariablePoint viewDirection() {
    VariableValue const* const value = Variables::instance().get(L"VIEWDIR");
    VariablePoint const* const numbers = value ? std::get_if<VariablePoint>(value) : nullptr;
    return numbers ? *numbers : VariablePoint{0, 0, 1};
}

// Restoring a system must not fail for want of memory, which telling observers may take.
void setViewDirection(VariablePoint const& numbers) {
    Variables& variables = Variables::instance();
    try {
        (void)variables.set(L"VIEWDIR", numbers, Writer::host);
    } catch (std::bad_alloc const&) {
        (void)variables.setKept(L"VIEWDIR", numbers);
    }
}

// Turns VIEWDIR from one user system to another, so that the view stands still.
void turnViewDirection(UserSystem const& from, UserSystem const& to) {
    if (from.isSameAs(to)) return;
    VariablePoint const numbers = viewDirection();
    TzGeVector3d direction(numbers[0], numbers[1], numbers[2]);
    TzGeMatrix3d fromAxes = from.matrix();
    TzGeMatrix3d toAxes = to.matrix();
    direction.transformBy(fromAxes).transformBy(toAxes.inverse());
    // Numbers of a rotated direction are finite and not all zero, so the variable takes them.
    setViewDirection({direction.x, direction.y, direction.z});
}

void place(Drawing& drawing, TzDbObjectId space, UserSystem const& system) {
    DrawingSettings settings = drawing.settings();
    bool const isActive = space == drawing.activeSpace();
    if (isActive) turnViewDirection(systemOf(drawing, space), system);
    (space == drawing.paperSpace() ? settings.paperSystem : settings.modelSystem) = system;
    drawing.restoreSettings(settings);
}

bool isProper(UserSystem const& system) {
    constexpr double kSlack = 1e-9;
    TzGeTol const tolerance(kSlack);
    return isFinite(system.origin) && isDirection(system.xAxis) && isDirection(system.yAxis) &&
           system.xAxis.isEqualTo(system.xAxis.normal(), tolerance) &&
           system.yAxis.isEqualTo(system.yAxis.normal(), tolerance) &&
           system.xAxis.isPerpendicularTo(system.yAxis, tolerance);
}

template <class Triple>
Event threeNumbers(Triple const& value) {
    return Event::array({value.x, value.y, value.z});
}

void reportSystem(char const* action, UserSystem const& system) {
    reportEvent([&] {
        return Event{{"event", "ucs"},
                     {"action", action},
                     {"origin", threeNumbers(system.origin)},
                     {"x", threeNumbers(system.xAxis)},
                     {"y", threeNumbers(system.yAxis)}};
    });
}

// The system that was in force when TILEMODE or CVPORT was last looked at.
UserSystem& systemBefore() {
    static UserSystem system;
    return system;
}

}  // namespace

UserSystem currentUserSystem(TzDbDatabase* database) {
    Drawing const* const drawing = drawingOf(database);
    return drawing ? systemOf(*drawing, drawing->activeSpace()) : UserSystem();
}

bool setUserSystem(UserSystem const& system) {
    Drawing* const drawing = workingDrawing();
    if (!drawing || !isProper(system)) return false;
    place(*drawing, drawing->activeSpace(), system);
    systemBefore() = system;
    return true;
}

void noteUserSystem() {
    systemBefore() = currentUserSystem();
}

void watchUserSystem() {
    static bool watching = false;
    if (std::exchange(watching, true)) return;
    Variables::instance().addObserver([](VariableWrite const& write) {
        if (write.definition.name != L"TILEMODE" && write.definition.name != L"CVPORT") return;
        UserSystem const now = currentUserSystem();
        turnViewDirection(systemBefore(), now);
        systemBefore() = now;
    });
}

}  // namespace tzhost

using tzhost::UserSystem;

namespace {

bool convert(TzGeMatrix3d const& matrix, double const* from, double* to, bool isVector) {
    if (!from || !to) return false;
    TzGePoint3d point(from[0], from[1], from[2]);
    if (isVector) {
        TzGeVector3d vector = point.asVector();
        vector.transformBy(matrix);
        point = {vector.x, vector.y, vector.z};
    } else {
        point.transformBy(matrix);
    }
    if (!tzhost::isFinite(point)) return false;
    to[0] = point.x;
    to[1] = point.y;
    to[2] = point.z;
    return true;
}

}  // namespace

bool tzdbUcs2Wcs(double const* user, double* world, bool isVector) {
    if (tzhost::faultStatus("tzdbUcs2Wcs")) return false;
    return convert(tzhost::currentUserSystem().matrix(), user, world, isVector);
}

bool tzdbWcs2Ucs(double const* world, double* user, bool isVector) {
    if (tzhost::faultStatus("tzdbWcs2Ucs")) return false;
    return convert(tzhost::currentUserSystem().matrix().inverse(), world, user, isVector);
}

int tzedSetCurrentUCS(TzGeMatrix3d const& system) {
    if (auto const fault = tzhost::faultStatus("tzedSetCurrentUCS")) return fault;
    tzhost::Drawing* const drawing = tzhost::workingDrawing();
    if (!drawing) return Tzad::eNoDocument;
    UserSystem const next{system.origin(), system.xAxis(), system.yAxis()};
    constexpr double kSlack = 1e-9;
    TzGeVector3d const normal = next.xAxis.crossProduct(next.yAxis);
    if (!tzhost::isProper(next) || !normal.isEqualTo(system.zAxis(), TzGeTol(kSlack))) {
        return Tzad::eInvalidInput;
    }
    TzDbObjectId const space = drawing->activeSpace();
    tzhost::Remembered before{
        drawing->serial(), space, tzhost::systemOf(*drawing, space), tzhost::viewDirection(), {}};
    tzhost::stack().reserve(tzhost::stack().size() + 1);
    (void)tzhost::setUserSystem(next);  // checked above
    before.turnedView = tzhost::viewDirection();
    tzhost::stack().push_back(before);
    ++tzhost::audit().ucsStack;
    tzhost::reportSystem("set", next);
    return Tzad::eOk;
}

// Restores even when the fault plan makes it report a failure.
int tzedRestorePreviousUCS() {
    tzhost::MemoryFaultPause const givesBack;
    auto const fault = tzhost::faultStatus("tzedRestorePreviousUCS");
    if (tzhost::stack().empty()) return Tzad::eNotApplicable;
    tzhost::Remembered const last = tzhost::stack().back();
    tzhost::stack().pop_back();
    --tzhost::audit().ucsStack;
    tzhost::Drawing* const drawing = tzhost::drawingWithSerial(last.drawing);
    if (!drawing) return Tzad::eNoDocument;
    bool const isViewKept =
        last.space == drawing->activeSpace() && tzhost::viewDirection() == last.turnedView;
    tzhost::place(*drawing, last.space, last.system);
    // Turning the view back rounds its numbers; a view that nobody changed gets its own again.
    if (isViewKept && tzhost::viewDirection() != last.view) tzhost::setViewDirection(last.view);
    tzhost::noteUserSystem();
    tzhost::reportSystem("restore", last.system);
    return fault;
}

int tzedGetCurrentUCS(TzGeMatrix3d& system) {
    if (auto const fault = tzhost::faultStatus("tzedGetCurrentUCS")) return fault;
    if (!tzhost::workingDrawing()) return Tzad::eNoDocument;
    system = tzhost::currentUserSystem().matrix();
    return Tzad::eOk;
}
