// MTEDIT and MTPROP: one text, selected before or picked, goes to the editor.

#include "tz/mte/edit_mtext.h"

#include "module/commands/edit_report.h"
#include "module/commands/mtext_selection.h"
#include "module/edit/editor_result.h"
#include "module/holders/scope_guard.h"
#include "module/host_calls/class_registration.h"
#include "module/texts/string_table.h"
#include "module/texts/text_ids.h"
#include "tz/ed/print.h"
#include "tz/ed/selection.h"
#include "tz/mte/entry_points.h"

namespace {

// The arguments of the command, which go on to the editor.
struct EditorSide {
    MTETabType tab;
    bool interactive;
    bool view;
};

TzRxObject* makeEditMtext() {
    return newTzxEditMtext();
}

// Reports the begin of a session, runs it, and reports a success.
template <class Edit>
void runReported(EditReport const& report, Edit edit) {
    report.begin();
    if (edit() == kEditorAccepted) report.success();
}

// Edits the first text of the set. A set whose length the host does not tell is neither edited nor
// freed here; the host frees it when the command ends.
void editSelected(long long* set, EditReport const& report, EditorSide const& side) {
    int length = 0;
    if (tzedSSLength(set, &length) != Tzad::ePromptNormal) return;
    TzScopeGuard const freed(nullptr, [set] { tzedSSFree(set); });
    runReported(report, [&] {
        if (length != 1) tzutPrintf(L"%ls", gStringTable[kText.onlyTheFirst].kwszPtr());
        return EditMtextInSelectionSet(set, side.tab, side.interactive, side.view);
    });
}

// Asks until an entity is picked or a pick hits nothing; false when the user cancelled. A pick that
// hits nothing leaves the name zero; no object has that name, so no editor opens.
bool pickOne(long long* name) {
    TzString const prompt = gStringTable[kText.pickText];
    for (;;) {
        double point[3] = {};
        switch (tzedEntSel(prompt, name, point)) {
        case Tzad::ePromptCancel: return false;
        case Tzad::ePromptNormal:
        case Tzad::ePromptError: return true;
        default: break;
        }
    }
}

}  // namespace

TzRxClass* TzxEditMtext::gpDesc = nullptr;

TzRxClass* TzxEditMtext::desc() {
    return gpDesc;
}

TzRxClass* TzxEditMtext::isA() const {
    return gpDesc;
}

TzRxClass* TzxEditMtext::rxInit() {
    return registerRuntimeClass(gpDesc, L"TzxEditMtext", L"TzRxObject", makeEditMtext);
}

TzxEditMtext* newTzxEditMtext() {
    return new TzxEditMtext;
}

void TzxEditMtext::EditMtext(MTETabType tab, bool interactive, bool view) {
    EditReport const report(L"MTEDIT");
    EditorSide const side{tab, interactive, view};
    long long set[2] = {};
    int const status = selectMText(set, L"_I", KindCode::group);
    if (status == Tzad::ePromptNormal) editSelected(set, report, side);
    if (status != Tzad::ePromptError) return;
    tzedSSFree(set);
    long long name[2] = {};
    if (!pickOne(name)) return;
    runReported(report, [&] { return EditMtextByAdsName(name, tab, interactive, view); });
}

int EditMtextByAdsName(long long* name, MTETabType tab, bool interactive, bool view) {
    TzDbObjectId id;
    if (tzdbGetObjectId(id, name) != Tzad::eOk) return kNoEditor;
    return InvokeEditorOn(id, tab, 0, interactive, view);
}

int EditMtextInSelectionSet(long long* set, MTETabType tab, bool interactive, bool view) {
    long long name[2] = {};
    // When the set has no first entity the name stays zero, which is the name of no object.
    (void)tzedSSName(set, 0, name);
    return EditMtextByAdsName(name, tab, interactive, view);
}
