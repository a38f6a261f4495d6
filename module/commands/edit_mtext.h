#pragma once

#include "tz/mte/edit_mtext.h"

// Opens the editor on the text that one of the host's older names means; the result is that of
// InvokeEditorOn, 3 for a name of no object.
[[nodiscard]] int
EditMtextByAdsName(long long const* name, MTETabType tab, bool interactive, bool view);
