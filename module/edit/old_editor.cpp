#include "module/edit/old_editor.h"

#include "module/edit/editor_result.h"
#include "module/texts/string_table.h"
#include "module/texts/text_ids.h"
#include "tz/ed/print.h"
#include "tz/mte/globals.h"

int InvokeOldEditorOn(EasyObject<TzDbMText>&, MTETabType, unsigned int, bool) {
    tzutPrintf(L"%ls", gStringTable[kText.noDialogEditor].kwszPtr());
    return kNoEditor;
}

void resetFontList() {
    gpFontList = nullptr;
}
