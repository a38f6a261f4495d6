#pragma once

#include "tz/export.h"

struct resbuf;

// Functions that a module defines for the host's interpreter, for each drawing anew:
//   1. message 3: tzedDefun for each function
//   2. message 5: tzedGetFunCode, tzedGetArgs, then one of the tzedRet operations
//   3. message 4: tzedUndef for each function
// Statuses are 5100 and -5001.

// [message 3] Defines a function of the current drawing under `name`; tzedGetFunCode gives `code`
// when it is called.
[[nodiscard]] TZ_API int tzedDefun(wchar_t const* name, int code);
// [message 4] Takes a definition back.
TZ_API int tzedUndef(wchar_t const* name, int code);
// [message 5] The code of the function that is being called; -5001 outside a call.
[[nodiscard]] TZ_API int tzedGetFunCode();
// [message 5] The arguments of the call, null without any. Owned by the host, valid during the
// call.
[[nodiscard]] TZ_API resbuf* tzedGetArgs();
// [message 5] The call gives nothing back to the interpreter.
TZ_API int tzedRetVoid();
