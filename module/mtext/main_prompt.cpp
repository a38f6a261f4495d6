// The first half of the dialogue of MTEXT: the first corner.

#include "module/geometry/points.h"
#include "module/holders/scope_guard.h"
#include "module/host_calls/sys_var.h"
#include "module/host_calls/unit_converter.h"
#include "module/mtext/first_point_jig.h"
#include "module/prompt/asking.h"
#include "module/prompt/jig_input.h"
#include "module/styles/style_rules.h"
#include "module/texts/string_table.h"
#include "module/texts/text_ids.h"
#include "tz/ap/document.h"
#include "tz/ap/gesture.h"
#include "tz/ed/editors.h"
#include "tz/ed/print.h"
#include "tz/ed/ucs.h"
#include "tz/mte/mtext_command.h"

namespace {

namespace Gesture = Tzworks::Tzdraft::TzApGesture;

// The telemetry of a first corner.
constexpr int kCornerPhase = 0;
constexpr int kAskedCorner = 4;

constexpr auto kControls = static_cast<TzEdJig::UserInputControls>(TzEdJig::kGovernedByUCSDetect |
                                                                   TzEdJig::kAccept3dCoordinates);

Tzworks::Tzdraft::TzApView* currentView() {
    return tzDocManagerPtr()->curDocument()->view();
}

// Asks for the point while a press and drag of the pointer may give both corners of the box.
int promptWithGesture(CTzsJigInput& input) {
    Gesture::DragGestureOverruleHandler handler(currentView());
    TzScopeGuard const registered(
        [&handler] { currentView()->gestureProcessor()->addOverruleHandler(&handler); },
        [&handler] { currentView()->gestureProcessor()->removeOverruleHandler(&handler); });
    return input.Prompt();
}

void printStatusLine(TzxMtextCommand const& command) {
    bool const annotative = StyleIsAnnotative(GetTextStyleID(command.styleName));
    TzString const style = TzString::formatted(L"\"%ls\"", command.styleName.kwszPtr());
    TzString const height = CLinearUnitConverter(kLinearUnitsOfDrawing, kPrecisionOfDrawing)
                                .MapDoubleToUnit(command.textHeight);
    tzutPrintf(gStringTable[kText.statusLine], style.kwszPtr(), height.kwszPtr(),
               gStringTable[annotative ? kText.annotative : kText.notAnnotative].kwszPtr());
}

}  // namespace

bool TzxMtextCommand::DoMainPrompt(bool forAttribute, bool wantSecondPoint) {
    if (StyleIsAnnotative(GetTextStyleID(styleName)))
        (void)tzedInvokeAnnoSelectScaleDlg();  // the scale in force counts, whatever this returns
    if (!forAttribute) printStatusLine(*this);

    CTzsMtextFirstPointJig jig(TzGePoint3d::kOrigin);
    CKeywordTable none;
    CTzsJigInput input(kControls, none, &jig,
                       gStringTable[forAttribute ? kText.insertionPoint : kText.firstCorner]);
    // An empty answer takes the point where the preview stands.
    for (int status = 0; !isAnswered(status);) {
        status = promptWithGesture(input);
        if (status == statusCancel) return false;
    }

    // A value that the host refuses here stays as it is; the corner is taken all the same.
    TzGePoint3d const corner = jig.cursor();
    setCoordinates(firstCornerUcs, corner);
    (void)tzdbWcs2Ucs(firstCornerUcs, firstCornerUcs, false);
    setCoordinates(location, corner);
    (void)CTzadSysVar::SetPoint(L"LASTPOINT", corner);
    telemetry.set_start_point(input.getInputData());
    telemetry.SendEvent(kCornerPhase, kAskedCorner);
    if (wantSecondPoint) return DoSecondPointPrompt(forAttribute);
    telemetry.set_end_point(input.getInputData());
    return true;
}
