// MARK: asks for the number, its angle and what it points at, and drags the circle to its place.

#include "bodies.h"
#include "mark_preview.h"
#include "posting.h"
#include "tz/db/mtext.h"
#include "tz/db/shapes.h"
#include "tz/ed/jig.h"
#include "tz/ed/print.h"
#include "tz/ed/prompt_objects.h"
#include "tz/ed/prompts.h"
#include "tz/ed/telemetry.h"
#include "tz/ed/ucs.h"
#include "tz/ge/matrix3d.h"
#include "tz/rx/status.h"

namespace marks {
namespace {

constexpr int kTelemetryComponent = 12;
constexpr int kBegin = 0;
constexpr int kSuccess = 1;
// The words Bigger and Smaller of the drag, in their order, and what they change the radius by.
constexpr int kBigger = TzEdJig::kKW1;
constexpr int kSmaller = kBigger + 1;
constexpr double kStep = 1.5;

class MarkJig : public TzEdJig {
public:
    explicit MarkJig(Mark const& mark) {
        preview_.mark = mark;
        setDispPrompt(L"\nPlace of the mark or [Bigger/Smaller]: ");
        setKeywordList(L"Bigger Smaller");
        setUserInputControls(
            static_cast<UserInputControls>(kGovernedByOrthoMode | kAccept3dCoordinates));
    }

    // Drags until a place is given; false when the user gave none.
    bool run() {
        for (;;) {
            int const status = drag();
            if (status == kNormal) return true;
            if (status != kBigger && status != kSmaller) return false;
            preview_.mark.radius *= status == kBigger ? kStep : 1 / kStep;
        }
    }
    [[nodiscard]] Mark const& mark() const { return preview_.mark; }

    DragStatus sampler() override { return acquirePoint(place_, preview_.mark.target); }
    bool update() override {
        preview_.mark.centre = place_;
        return true;
    }
    [[nodiscard]] TzDbEntity* entity() const override { return &preview_; }

private:
    mutable MarkPreview preview_;
    TzGePoint3d place_;
};

// The user system gives the plane and, turned by an angle that is asked for, the direction.
bool askDirection(Mark& mark) {
    TzGeMatrix3d system;
    if (tzedGetCurrentUCS(system) != Tzad::eOk) return false;
    mark.normal = TzGeVector3d::kZAxis;
    mark.normal.transformBy(system);
    TzEdPromptAngle prompt(L"\nAngle of the number <0>: ");
    prompt.setDefaultValue(0);
    if (prompt.getAngle() != Tzad::ePromptNormal) return false;
    mark.direction = TzGeVector3d::kXAxis;
    mark.direction.transformBy(system).rotateBy(prompt.value(), mark.normal);
    return true;
}

bool askTarget(Mark& mark) {
    double point[3]{};
    tzedInitGet(1, nullptr);
    if (tzedGetPoint(nullptr, L"\nWhat the mark points at: ", point) != Tzad::ePromptNormal)
        return false;
    double world[3]{};
    if (!tzdbUcs2Wcs(point, world, false)) return false;
    mark.target = {world[0], world[1], world[2]};
    return true;
}

bool askMark(Mark& mark) {
    int number = 1;
    int const status = tzedGetInt(L"\nNumber of the mark <1>: ", &number, 1, 9999);
    if (status != Tzad::ePromptNormal && status != Tzad::ePromptNone) return false;
    mark.number = TzString::formatted(L"%d", number);
    tzedInitGet(2 | 4, nullptr);
    int const sized = tzedGetDist(nullptr, L"\nRadius <1>: ", &mark.radius);
    if (sized != Tzad::ePromptNormal && sized != Tzad::ePromptNone) return false;
    return askDirection(mark) && askTarget(mark);
}

// The numbers come from questions that refuse what the host would; so in all three.
void postCircle(Mark const& mark) {
    auto* const circle = new TzDbCircle;
    circle->setDatabaseDefaults();
    (void)circle->setNormal(mark.normal);
    (void)circle->setCenter(mark.centre);
    (void)circle->setRadius(mark.radius);
    (void)post(circle);  // the rest of the mark stands without it
}

void postLine(Mark const& mark) {
    auto* const line = new TzDbLine;
    line->setDatabaseDefaults();
    (void)line->setStartPoint(mark.lineStart());
    (void)line->setEndPoint(mark.target);
    (void)post(line);  // the rest of the mark stands without it
}

TzDbObjectId postNumber(Mark const& mark) {
    auto* const text = new TzDbMText;
    text->setDatabaseDefaults();
    (void)text->setNormal(mark.normal);
    (void)text->setDirection(mark.direction);
    (void)text->setAttachment(TzDbMText::kMiddleCenter);
    (void)text->setLocation(mark.centre);
    (void)text->setTextHeight(mark.radius);
    (void)text->setContents(mark.number);
    return post(text);
}

}  // namespace

void markCommand() {
    TzTelemetryCmdHelper telemetry(kTelemetryComponent, L"SheetMark");
    telemetry.SendEvent(kBegin, 0);
    Mark mark;
    if (!askMark(mark)) return;
    MarkJig jig(mark);
    if (!jig.run()) return;
    telemetry.set_end_point(tzedGetJigInputData(jig));
    postCircle(jig.mark());
    if (jig.mark().hasLine()) postLine(jig.mark());
    TzDbObjectId const number = postNumber(jig.mark());
    tzutPrintf(L"\nMark %ls at %ls.\n", mark.number.kwszPtr(),
               inUserUnits(jig.mark().centre).kwszPtr());
    if (number.isValid()) telemetry.SendEvent(kSuccess, 0);
}

}  // namespace marks
