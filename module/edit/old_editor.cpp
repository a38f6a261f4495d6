#include "module/edit/old_editor.h"

#include "module/edit/editor_result.h"
#include "tz/ed/print.h"
#include "tz/mte/globals.h"

int InvokeOldEditorOn(EasyObject<TzDbMText>&, MTETabType, unsigned int, bool) {
    tzutPrintf(L"\nThe dialog editor is not part of this version; MTEXTED chooses another one.\n");
    return kNoEditor;
}

void resetFontList() {
    gpFontList = nullptr;
}
