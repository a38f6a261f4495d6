#pragma once

// System variables as value records. Names count without case.
//
//   resbuf value{};
//   if (tzedGetVar(L"TEXTSIZE", &value) == Tzad::ePromptNormal) use(value.resval.rreal);

#include "tz/export.h"
#include "tz/rx/resbuf.h"

// [any] Reads a variable: `result` takes its type (5001 real, 5003 short, 5005 string, 5009 point)
// and value. A string is the caller's, who releases it with tzutDelString. 5100, or -5001 for an
// unknown name, which leaves `result` as it is.
[[nodiscard]] TZ_API int tzedGetVar(wchar_t const* name, resbuf* result);

// [any] Writes a variable; the record keeps its string. 5100, or -5001 for an unknown name, a
// read-only variable, another type than the variable's or a value outside its limits; then nothing
// changes.
[[nodiscard]] TZ_API int tzedSetVar(wchar_t const* name, resbuf const* value);
