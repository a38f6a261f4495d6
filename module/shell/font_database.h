#pragma once

#include "tz/export.h"

// The font map database's place in the life of the module: its tables are the process's own, so
// they outlive the objects that fill and empty them.
TZ_API void LoadFontDatabase();
TZ_API void UnloadFontDatabase();
// LoadFontDatabase in the form of a thread's entry; gives 0. No thread of the module's runs it.
TZ_API int FontDatabaseLoader(void* unused);
