#include "module/edit/old_editor.h"

#include "module/edit/editor_placement.h"
#include "module/edit/editor_result.h"
#include "module/edit/entity_exchange.h"
#include "module/edit/hidden_text.h"
#include "module/edit/mtext_versioner.h"
#include "module/texts/string_table.h"
#include "module/texts/text_ids.h"
#include "tz/ed/ucs.h"
#include "tz/ge/matrix3d.h"
#include "tz/mte/editor_state.h"
#include "tz/mte/globals.h"
#include "tz/pal/message_box.h"

namespace {

// Any of these bits keeps the dialog closed.
constexpr unsigned kNoDialogMask = 0xFF;

// The editor of one session.
class SessionEditor {
public:
    SessionEditor() : editor_(new_CMTextEditorInterface()) {}
    SessionEditor(SessionEditor const&) = delete;
    SessionEditor& operator=(SessionEditor const&) = delete;
    ~SessionEditor() { delete_CMTextEditorInterface(editor_); }
    CMTextEditorInterface* operator->() const { return editor_; }
    CMTextEditorInterface& operator*() const { return *editor_; }

private:
    CMTextEditorInterface* editor_;
};

// With a window at a fixed place the text stays as it is; else the window stands over it, and the
// text is hidden.
void makeRoom(EasyObject<TzDbMText>& text, HiddenText& session) {
    if (gMTextFixed) {
        g_dMTextObjectHeight = 0.0;
        gwysiwyg = 0;
        return;
    }
    CalcEditorSizeAndPosition(text);
    TzGeMatrix3d userSystem;
    (void)tzedGetCurrentUCS(userSystem);  // read, and put to no use
    session.hide();
}

// What the dialog ended with. It is not shown a text of a newer format, nor one whose field cannot
// be opened: what it left would take the place of the field.
int runDialog(CMTextEditorInterface& editor,
              EasyObject<TzDbMText>& text,
              MTETabType tab,
              unsigned int flags) {
    CStdStrW contents;
    if (!contentsForEditor(*text.object, contents) ||
        MTextVersioner(text.object).too_new(contents.c_str()))
        return kEditorLeft;
    editor.SetMTextString(contents);
    editor.SetActiveTab(static_cast<CMTextEditorInterface::EditTab>(tab));
    return (flags & kNoDialogMask) != 0 ? kEditorLeft : editor.DoModal();
}

}  // namespace

int InvokeOldEditorOn(EasyObject<TzDbMText>& text, MTETabType tab, unsigned int flags, bool) {
    HiddenText session(*text.object);
    makeRoom(text, session);
    SessionEditor const editor;
    feedEditor(*editor, text);
    unsigned int const fedColor = editor->GetInitialColor();
    int const answer = runDialog(*editor, text, tab, flags);
    if (!session.show()) {
        MessageBox(nullptr, gStringTable[kText.notWritable].kwszPtr(), nullptr, kMessageBoxError);
        return kNoEditor;
    }
    // Any answer but the first is a cancel.
    if (answer != kEditorAccepted) return kEditorLeft;
    takeFromEditor(*editor, text, fedColor);
    return kEditorAccepted;
}

void resetFontList() {
    gpFontList = nullptr;
}
