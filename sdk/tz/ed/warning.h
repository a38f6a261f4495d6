#pragma once

#include "tz/export.h"

// [command] Shows the host's dismissible warning. `id` names it among the warnings that a user may
// silence; `printed` says whether its text also goes to the command line; `format` is read as a
// format without arguments, so that a stray percent sign in it is a fault of the caller.
TZ_API void tzutWarning(wchar_t const* id, bool printed, wchar_t const* format);
