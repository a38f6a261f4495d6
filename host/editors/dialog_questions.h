#pragma once

#include "host/editors/dialog_values.h"

// The values of a dialog's session, asked for at the command line one after the other.
namespace tzhost {

// Enter keeps a value. False when the user cancelled; nothing is stored either way.
[[nodiscard]] bool askDialogValues(CMTextEditorInterface const& state, DialogChanges& changes);

}  // namespace tzhost
