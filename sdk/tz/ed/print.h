#pragma once

// Text for the user's command line. What is printed starts on a new line when it begins with one,
// and the caller writes its own line ends.
//
//   tzutPrintf(L"\n%d found.", count);

#include "tz/export.h"

// [any] Prints a formatted text; %s and %ls take wide text, numbers follow no locale. Returns 5100.
TZ_API int tzutPrintf(wchar_t const* format, ...);
// [any] Shows the command line's text, for a command that is about to print a list. Returns 5100.
TZ_API int tzedTextScr();
