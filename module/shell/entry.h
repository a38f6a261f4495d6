#pragma once

#include "module/holders/handle_object.h"
#include "tz/rx/app.h"

// The module's front door: the host sends every message through tzrxEntryPoint, which hands it on.

// Loads, unloads, serves the functions of the interpreter; 0, or 3 for a failure. Any message that
// is none of the five does nothing and gives 0. `appHandle` is used only when the module is loaded.
[[nodiscard]] int tzrxEntryPoint_Mte(TzRx::AppMsgCode message, void* appHandle);

// Never holds a handle, since the module starts no thread.
extern CHandleObject ghBackgroundThread;
