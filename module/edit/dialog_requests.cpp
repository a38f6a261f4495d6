// What a dialog may ask for while its session runs.

#include "module/edit/hidden_text.h"
#include "module/texts/string_table.h"
#include "module/texts/text_ids.h"
#include "tz/ap/document.h"
#include "tz/ed/editors.h"
#include "tz/mte/dialog_session.h"
#include "tz/mte/globals.h"
#include "tz/pal/message_box.h"

namespace {

TzDbMText* sessionText() {
    return gpText ? gpText->object : nullptr;
}

}  // namespace

// No step looks at the outcome of the one before.
void PanZoomMText(bool zoomIn) {
    if (TzDbMText* const text = sessionText()) {
        (void)text->upgradeOpen();
        (void)text->setVisibility(TzDb::kVisible, true);
        (void)text->downgradeOpen();
    }
    redrawAll();
    tzedZoomToolHook(zoomIn, false, true);
    TzApDocManager* const documents = tzDocManagerPtr();
    (void)documents->sendStringToExecute(
        documents->curDocument(), TzString::formatted(L"_.mtedit %f, %f ", gdx, gdy).kwszPtr(),
        false, true, false);
}

void SetVisibility() {
    TzDbMText* const text = sessionText();
    if (!text) return;
    if (text->isWriteEnabled() || text->upgradeOpen() == Tzad::eOk) {
        (void)text->setVisibility(TzDb::kVisible, true);
        (void)text->downgradeOpen();  // one that is in no drawing stays writable
    } else {
        MessageBox(nullptr, gStringTable[kText.notWritable].kwszPtr(), nullptr, kMessageBoxError);
    }
    redrawAll();
}
