#include "module/edit/editor_choice.h"

#include "module/host_calls/sys_var.h"
#include "module/texts/resources.h"
#include "module/texts/text_ids.h"
#include "tz/ed/editors.h"
#include "tz/pal/settings.h"

namespace {

TzString const& builtInEditor() {
    static TzString const name = loadResourceString(kText.inPlaceEditor);
    return name;
}

}  // namespace

TextEditorKind chooseTextEditor() {
    if (Tzworks::Tzdraft::PAL::Process::isFabric()) return TextEditorKind::inPlace;
    TzString const chosen = CTzadSysVar::GetString(L"MTEXTED");
    if (chosen.isEmpty() || chosen.compareNoCase(builtInEditor()) == 0)
        return TextEditorKind::inPlace;
    if (chosen.compareNoCase(L"OLDEDITOR") == 0) return TextEditorKind::dialog;
    if (chosen.compareNoCase(builtInEditor() + L"-") == 0) return TextEditorKind::raw;
    return IPEIsEditor(true) ? TextEditorKind::inPlace : TextEditorKind::external;
}
