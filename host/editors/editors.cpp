#include "tz/ed/editors.h"

#include <utility>

#include "host/base/fault_point.h"
#include "host/command_line/command_line.h"
#include "host/editors/dialog_questions.h"
#include "host/editors/edited_markup.h"
#include "host/editors/edited_rtf.h"
#include "host/editors/editor_events.h"
#include "host/editors/editor_programs.h"
#include "host/editors/editor_session.h"
#include "host/runtime/class_registry.h"
#include "host/runtime/notification.h"
#include "host/settings/variables.h"
#include "host/text/local_text.h"
#include "tz/ap/host_dialog.h"
#include "tz/db/mtext.h"
#include "tz/mte/dialog_params.h"
#include "tz/mte/editor_state.h"

namespace tzhost {
namespace {

constexpr int kLeft = 0;
constexpr int kAccepted = 1;

// Edits the text's markup with a program or the script's block; kAccepted or kLeft.
int editMarkup(TzDbMText& text,
               char const* kind,
               std::string const& program,
               IPESettings const* settings) {
    EditedMarkup markup(text);
    bool accepted = false;
    if (markup.canBeRead()) {
        wchar_t const* const lack =
            localText(L"There is no editor: --text-editor, the settings, $VISUAL or $EDITOR name "
                      L"one; -MTEXT takes the text at the command line.");
        accepted = runEditorSession(markup, {program, lack}) == SessionEnd::accepted;
    } else {
        commandLine().sayProblem(
            localText(L"The text has a field that cannot be opened; it stays as it was."));
    }
    reportEditor(kind, accepted, settings);
    return accepted ? kAccepted : kLeft;
}

// Runs the editor on the plain markup for its dialog's parameters.
void runRawEditor(TzApHostDialogParams& params) {
    auto const& raw = static_cast<TzApHostRawEditorParamsFrameless const&>(params);
    EasyObject<TzDbMText> const* const text = raw.easyMText();
    if (!text || !text->object) return params.setReturnCode(3);
    bool const accepted =
        editMarkup(*text->object, "raw", textEditorProgram(), nullptr) == kAccepted;
    params.setReturnCode(accepted ? 1 : 2);
}

// Edits the text of the dialog's session as rich text; whether it was accepted.
bool editRichText(CMTextEditorInterface& state) {
    EditedRtf rtf(state);
    if (!rtf.failure().empty()) {
        commandLine().sayProblem(rtf.failure());
        return false;
    }
    DialogChanges changes;
    bool const isAsked =
        state.GetActiveTab() == CMTextEditorInterface::kPropertiesTab && commandLine().isPerson();
    if (isAsked && !askDialogValues(state, changes)) return false;
    rtf.setChanges(std::move(changes));
    std::string const& command = editorConfiguration().richTextEditor;
    if (isAsked && command.empty()) return rtf.take({}).taken != Taken::refused;
    wchar_t const* const lack =
        localText(L"There is no editor for rich text: --rtf-editor or the settings name one.");
    return runEditorSession(rtf, {command, lack}) == SessionEnd::accepted;
}

void runDialogEditor(TzApHostDialogParams& params) {
    auto const& old = static_cast<TzApHostOldEditorParamsFrameless const&>(params);
    CMTextEditorState* const state = old.mTextEditorState();
    if (!state) return params.setReturnCode(3);
    bool const accepted = editRichText(*state);
    reportEditor("dialog", accepted, nullptr);
    params.setReturnCode(accepted ? 1 : 2);
}

struct DialogRow {
    wchar_t const* parameterClass;
    void (*run)(TzApHostDialogParams&);
};

constexpr DialogRow kDialogs[] = {
    {L"TzApHostRawEditorParamsFrameless", runRawEditor},
    {L"TzApHostOldEditorParamsFrameless", runDialogEditor},
};

}  // namespace
}  // namespace tzhost

int IPEInvokeEditorOn(TzDbMText* text, IPESettings const* settings) {
    if (tzhost::faultAt("IPEInvokeEditorOn") || !text || !settings) return tzhost::kLeft;
    return tzhost::editMarkup(*text, "inPlace", tzhost::textEditorProgram(), settings);
}

bool IPEIsEditor(bool /*current*/) {
    if (tzhost::faultAt("IPEIsEditor")) return false;
    TzString const name(tzhost::Variables::instance().text(L"MTEXTED"));
    for (std::wstring const& each : tzhost::editorConfiguration().inPlaceEditors) {
        if (name.compareNoCase(each.c_str()) == 0) return true;
    }
    return false;
}

int tzedEditMTextInteractive(TzDbMText* text, bool /*interactive*/, bool /*view*/) {
    if (tzhost::faultAt("tzedEditMTextInteractive") || !text) return tzhost::kLeft;
    TzString const program(tzhost::Variables::instance().text(L"MTEXTED"));
    return tzhost::editMarkup(*text, "external", program.toUtf8(), nullptr);
}

void tzedSetExistingMText(bool existing) {
    tzhost::reportNotification(existing ? "existingMText" : "newMText");
}

int tzedInvokeAnnoSelectScaleDlg() {
    tzhost::reportNotification("annotationScaleDialog");
    return Tzad::ePromptNormal;
}

void tzedUpdateDisplay() {
    tzhost::reportNotification("updateDisplay");
}

void tzedZoomToolHook(bool /*in*/, bool /*out*/, bool /*redraw*/) {
    tzhost::reportNotification("zoomTool");
}

void TzApHostDialogImp::run(TzApHostDialogParams& params) {
    params.setReturnCode(3);
    if (tzhost::faultAt("TzApHostDialogImp::run")) return;
    TzString const name(params.isA() ? params.isA()->name() : L"");
    for (tzhost::DialogRow const& row : tzhost::kDialogs) {
        if (name == row.parameterClass) return row.run(params);
    }
}

TzRxClass* TzApHostDialogParams::desc() {
    static TzRxClass* const descriptor =
        tzhost::hostClass(L"TzApHostDialogParams", TzRxObject::desc());
    return descriptor;
}
TzRxClass* TzApHostDialogParams::isA() const {
    return desc();
}

void TzApHostDialog::doModal(TzApHostDialogParams& params) {
    imp_->run(params);
}
