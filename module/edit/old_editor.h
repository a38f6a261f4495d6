#pragma once

#include "tz/db/mtext.h"
#include "tz/mte/easy_object.h"
#include "tz/mte/edit_mtext.h"

// The dialog editor on rich text.

// Runs one session on a text that is open for write; results as those of InvokeEditorOn. It is 3
// only when the text cannot be opened for write again once the dialog has ended.
[[nodiscard]] int
InvokeOldEditorOn(EasyObject<TzDbMText>& text, MTETabType tab, unsigned int flags, bool view);
// Drops the dialog's list of fonts, which the next session makes anew.
void resetFontList();
