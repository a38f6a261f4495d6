#include <utility>

#include "module/edit/editor_choice.h"
#include "module/edit/editor_result.h"
#include "module/edit/in_place_settings.h"
#include "module/edit/old_editor.h"
#include "module/edit/session_field.h"
#include "module/holders/easy_upgrade.h"
#include "module/host_calls/lock_tests.h"
#include "module/host_calls/sys_var.h"
#include "module/texts/string_table.h"
#include "module/texts/text_ids.h"
#include "tz/db/host_services.h"
#include "tz/ed/editors.h"
#include "tz/ed/print.h"
#include "tz/mte/dialog_params.h"
#include "tz/mte/edit_mtext.h"
#include "tz/mte/globals.h"
#include "tz/pal/message_box.h"

namespace {

int refuse(unsigned message) {
    tzutPrintf(L"%ls", gStringTable[message].kwszPtr());
    return kNoEditor;
}

// The message about the lock that forbids to edit a text; 0 when there is none.
unsigned lockMessage(TzDbMText* text) {
    if (!text) return 0;
    if (IsOnLockedLayer(text)) return kText.onLockedLayer;
    return IsLockedFromWorkingSet(text) ? kText.outsideWorkingSet : 0;
}

// Editors that tell no more than whether the user accepted.
int resultOf(int accepted) {
    return accepted == 0 ? kEditorLeft : kEditorAccepted;
}

int runInPlaceEditor(EasyObject<TzDbMText>& text, InPlaceOptions const& options) {
    IPESettings const settings = inPlaceSettings(*text.object, options);
    gbUsedIPE = 1;
    return resultOf(IPEInvokeEditorOn(text.object, &settings));
}

int runRawEditor(EasyObject<TzDbMText>& text) {
    TzApHostDialogRawEditor& dialog = TzApHostDialogRawEditor::instance();
    TzApHostRawEditorParamsFrameless params;
    params.setEasyMText(&text);
    dialog.doModal(params);
    return params.returnCode();
}

// Tells the world which text is being edited, for the length of the session. An editor may open
// another one: the outer text is then the edited one again, and its size the one that its
// conversions use.
class [[nodiscard]] EditedText {
public:
    explicit EditedText(EasyObject<TzDbMText>& text) : outer_(std::exchange(gpText, &text)) {}
    EditedText(EditedText const&) = delete;
    EditedText& operator=(EditedText const&) = delete;
    ~EditedText() {
        gpText = outer_;
        if (outer_) g_dTextSize = outerSize_;
    }

private:
    EasyObject<TzDbMText>* outer_;
    double outerSize_ = g_dTextSize;
};

}  // namespace

int InvokeEditorOn(EasyObject<TzDbMText>& text,
                   MTETabType tab,
                   unsigned int flags,
                   bool interactive,
                   bool view,
                   bool attribute,
                   bool option13,
                   bool option14) {
    if (!text.object) return refuse(kText.noMultilineText);
    CEasyUpgrade upgrade;
    if (!text->isWriteEnabled() && !upgrade.Upgrade(text.object)) {
        TwHostMessageBox::simple(gStringTable[kText.notWritable], kMessageBoxError);
        return kNoEditor;
    }
    gMTextFixed = 0;
    gMTextFixed = CTzadSysVar::GetInt(L"MTEXTFIXED");
    tzdbHostApplicationServices()->textEditorStarting();
    EditedText const edited(text);
    TzArray<TzGePoint3d> boundingPoints;  // measures the text before the session; not looked at
    text->getBoundingPoints(boundingPoints);
    resetFontList();

    switch (chooseTextEditor()) {
    case TextEditorKind::dialog: return InvokeOldEditorOn(text, tab, flags, view);
    case TextEditorKind::raw: return runRawEditor(text);
    case TextEditorKind::external:
        return resultOf(tzedEditMTextInteractive(text.object, interactive, view));
    case TextEditorKind::inPlace: break;
    }
    return runInPlaceEditor(text, {view, attribute, option13, option14});
}

int InvokeEditorOn(
    TzDbObjectId id, MTETabType tab, unsigned int flags, bool interactive, bool view) {
    EasyObject<TzDbMText> text;
    // A text that does not open leaves the holder empty, which the gate reports.
    (void)tzdbOpenObject(text.object, id, TzDb::kForRead);
    if (unsigned const lock = lockMessage(text.object)) return refuse(lock);
    tzedSetExistingMText(true);
    return InvokeEditorOn(text, tab, flags, interactive, view, false, false, false);
}

int InvokeEditorOn(TzDbMText* text,
                   MTETabType tab,
                   unsigned int flags,
                   bool interactive,
                   bool view,
                   bool option13,
                   bool option14) {
    EasyObject<TzDbMText> held(text);
    if (unsigned const lock = lockMessage(text)) return refuse(lock);
    SessionField field(held);
    int const result =
        InvokeEditorOn(held, tab, flags, interactive, view, false, option13, option14);
    if (result == kEditorAccepted) field.attachTo(*text);
    return result;
}
