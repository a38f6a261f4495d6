#pragma once

#include "tz/export.h"

// The parameter classes of the dialog editors, known to the host while the module is loaded: made
// known before tzrxBuildClassHierarchy, taken back at unload.

TZ_API void MteCoreDialogParamsRXInit();
// Does no harm when the classes are not known.
TZ_API void MteCoreDialogParamsRXUninit();
