#include "module/shell/callbacks.h"

#include <memory>

#include "module/align/align_command.h"
#include "module/commands/mtext_height.h"
#include "module/commands/mtext_properties.h"
#include "module/commands/mtext_selection.h"
#include "module/holders/scope_guard.h"
#include "module/host_calls/sys_var.h"
#include "tz/ed/prompts.h"
#include "tz/ed/selection.h"
#include "tz/mte/edit_mtext.h"
#include "tz/mte/entry_points.h"
#include "tz/mte/globals.h"
#include "tz/mte/mtext_command.h"

namespace {

// Bits of CMDACTIVE: the answers come from a script or from a program.
constexpr int kAnsweredWithoutUser = 4 | 32;

bool takesTextFromCommandLine() {
    if (tzedInitDialog(false)) return false;
    return (CTzadSysVar::GetInt(L"CMDACTIVE") & kAnsweredWithoutUser) != 0 && !tzedMacroPlayback();
}

bool always() {
    return true;
}

// When an exception passes, MTEXTCOMMANDACTIVE stays 1. The command runs also when the host refuses
// to set that variable. The result of CreateObject is not needed, since it deletes a text that the
// user did not accept.
void runMtext(bool (*commandLineEditor)()) {
    gdJigBoundBoxHeight = 0;
    std::unique_ptr<TzxMtextCommand> const command(newTzxMtextCommand());
    (void)CTzadSysVar::SetInt(L"MTEXTCOMMANDACTIVE", 1);
    command->UseCommandLineEditor(commandLineEditor());
    if (command->DoMainPrompt(false, true)) (void)command->CreateObject(nullptr, false);
    (void)CTzadSysVar::SetInt(L"MTEXTCOMMANDACTIVE", 0);
}

void editOneMtext(MTETabType tab) {
    std::unique_ptr<TzxEditMtext> const command(newTzxEditMtext());
    command->EditMtext(tab, true, true);
}

}  // namespace

void ImprovedMtextCallback() {
    runMtext(takesTextFromCommandLine);
}

void CompatibleMtextCallback() {
    runMtext(always);
}

void EditMtextCallback() {
    gdJigBoundBoxHeight = 0;
    editOneMtext(kMTETabText);
}

void MtpropCallback() {
    editOneMtext(kMTETabProperties);
}

void CompatibleEditMtextCallback() {
    long long set[2] = {};
    TzScopeGuard const freed(nullptr, [&set] { tzedSSFree(set); });
    if (selectMText(set, nullptr, KindCode::group) == Tzad::ePromptNormal)
        setHeightForSelectedMText(set);
}

void AlignTextCallback() {
    TzMTextAlignCmd command;
    command.run();
}

void MtextPropertiesCallback() {
    changeMtextProperties();
}
