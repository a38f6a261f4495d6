#include "module/edit/old_editor.h"

#include "module/edit/editor_result.h"
#include "module/texts/string_table.h"
#include "tz/ed/print.h"
#include "tz/mte/globals.h"

namespace {

constexpr unsigned kNoDialogEditor = 1025;

}  // namespace

int InvokeOldEditorOn(EasyObject<TzDbMText>&, MTETabType, unsigned int, bool) {
    tzutPrintf(L"%ls", gStringTable[kNoDialogEditor].kwszPtr());
    return kNoEditor;
}

void resetFontList() {
    gpFontList = nullptr;
}
