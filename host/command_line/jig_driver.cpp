#include "host/command_line/jig_driver.h"

#include <cmath>
#include <utility>

#include "host/command_line/point_input.h"
#include "host/database/drawing.h"
#include "host/database/user_system.h"
#include "host/display/frame.h"
#include "host/text/local_text.h"
#include "tz/ge/matrix3d.h"

using tzhost::Reply;

namespace {

constexpr wchar_t kMoveMark = L'~';

// Where the cursor stood last, world coordinates.
TzGePoint3d& cursor() {
    static TzGePoint3d place;
    return place;
}

TzGePoint3d toWorld(TzGePoint3d user) {
    return user.transformBy(tzhost::currentUserSystem().matrix());
}

TzGePoint3d toUser(TzGePoint3d world) {
    return world.transformBy(tzhost::currentUserSystem().matrix().inverse());
}

bool isOrthoOn() {
    tzhost::Drawing const* const drawing = tzhost::workingDrawing();
    return drawing != nullptr && drawing->orthomode();
}

// On the axis of the user system through `base` that the point is nearest to.
TzGePoint3d onAxis(TzGePoint3d const& world, TzGePoint3d const& base) {
    TzGePoint3d user = toUser(world);
    TzGePoint3d const from = toUser(base);
    if (std::fabs(user.x - from.x) >= std::fabs(user.y - from.y)) {
        user.y = from.y;
    } else {
        user.x = from.x;
    }
    return toWorld(user);
}

bool goesOn(int status) {
    return status == TzEdJig::kNormal || status == TzEdJig::kNoChange;
}

}  // namespace

void tzhost::resetDragCursor() {
    cursor() = TzGePoint3d::kOrigin;
}

TzEdJigDriver::TzEdJigDriver(TzEdJig& jig) : jig_(jig), outer_(std::exchange(jig.driver_, this)) {
    jig_.data_ = {};
}

TzEdJigDriver::~TzEdJigDriver() {
    jig_.driver_ = outer_;
}

bool TzEdJigDriver::has(TzEdJig::UserInputControls control) const {
    return (jig_.controls_ & control) != 0;
}

TzEdJig::DragStatus TzEdJigDriver::acquire(TzGePoint3d& point, TzGePoint3d const* base) {
    point = cursor();
    if (base != nullptr && has(TzEdJig::kGovernedByOrthoMode) && isOrthoOn()) {
        point = onAxis(point, *base);
    }
    bool const isSame = lastSample_ && lastSample_->isEqualTo(point);
    lastSample_ = point;
    jig_.data_ = {.hasPoint = true, .point = point};
    return isSame ? TzEdJig::kNoChange : TzEdJig::kNormal;
}

int TzEdJigDriver::sample() {
    int const status = jig_.sampler();
    isStale_ = status == TzEdJig::kNormal && jig_.update();
    return status;
}

void TzEdJigDriver::redraw() const {
    tzhost::reportFrame(jig_.entity(), tzhost::workingDrawing());
}

TzEdJig::DragStatus TzEdJigDriver::run() {
    // The first sample comes before the prompt, since a jig may set its keywords there.
    int const first = sample();
    if (!goesOn(first)) {
        int const status = tzhost::commandLine().failed(first);
        return status == Tzad::ePromptCancel ? TzEdJig::kCancel
                                             : static_cast<TzEdJig::DragStatus>(status);
    }
    isStale_ = isStale_ || first == TzEdJig::kNoChange;
    return static_cast<TzEdJig::DragStatus>(ask());
}

int TzEdJigDriver::ask() {
    std::wstring list(jig_.keywordList());
    auto words = tzhost::KeywordList::parse(list);
    tzhost::Armed armed{jig_.controls_, words ? std::move(*words) : tzhost::KeywordList(),
                        std::move(list)};
    tzhost::Question question(tzhost::QuestionKind::drag, jig_.prompt_, std::move(armed));
    question.clearFlags();
    question.setEndings(TzEdJig::kNull, TzEdJig::kCancel);
    question.setWordReader([](int index) { return Reply::done(index + 1); });
    if (isStale_) redraw();
    return question.ask([this](std::wstring_view answer) { return take(answer); });
}

Reply TzEdJigDriver::take(std::wstring_view answer) {
    bool const isMove = answer.starts_with(kMoveMark);
    if (isMove) answer.remove_prefix(1);
    auto point = tzhost::readPoint(answer, tzhost::lastPoint());
    if (!point && !isMove && has(TzEdJig::kAcceptOtherInputString)) {
        tzhost::commandLine().leaveInput(std::wstring(answer));
        return Reply::done(TzEdJig::kString);
    }
    if (!point)
        return Reply::unreadable(tzhost::localText(
            L"A point is needed: x,y or x,y,z; @x,y or @length<angle go from the last one; ~x,y moves the cursor."));
    if (!has(TzEdJig::kAccept3dCoordinates)) point->z = 0;
    return isMove ? moveTo(*point) : pick(*point);
}

Reply TzEdJigDriver::moveTo(TzGePoint3d const& user) {
    cursor() = toWorld(user);
    int const status = sample();
    if (!goesOn(status)) return Reply::done(status);
    if (isStale_) redraw();
    return Reply::goOn(status);
}

Reply TzEdJigDriver::pick(TzGePoint3d const& user) {
    if (!cursor().isEqualTo(toWorld(user))) {
        Reply const moved = moveTo(user);
        if (moved.kind == Reply::Kind::done) return moved;
    }
    // The way through world coordinates and back would round the numbers that were typed; a point
    // that ortho mode held elsewhere has no others.
    TzGePoint3d const& sampled = jig_.data_.point;
    bool const isAsTyped = !jig_.data_.hasPoint || sampled.isEqualTo(toWorld(user));
    tzhost::setLastPoint(isAsTyped ? user : toUser(sampled));
    return Reply::done(TzEdJig::kNormal);
}
