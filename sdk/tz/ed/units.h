#pragma once

#include "tz/export.h"
#include "tz/text/string.h"

// Lengths and angles as text and back. Linear units 1 to 5: scientific, decimal, feet and decimal
// inches, feet and fractional inches, fractional. Angular units 0 to 4: degrees, degrees with
// minutes and seconds, grads, radians, surveyor's. Precision 0 to 8: decimals, or the power of two
// of the denominator, or for units with minutes how far down it goes. No locale; statuses 5100 and
// -5001.

// [any] A length as text: 15.5 is "1.5500E+01", "15.5000", "1'-3.5000\"", "1'-3 1/2\"", "15 1/2".
[[nodiscard]] TZ_API int tzdbRToS(double value, int unit, int precision, TzString& text);
// [any] Radians as text: "45.0000", "45d30'0\"", "50.0000g", "0.7854r", "N 45d0'0\" E".
[[nodiscard]] TZ_API int tzdbAngToS(double radians, int unit, int precision, TzString& text);
// [any] The length or the angle in radians that a text stands for; every form is read under each
// unit. -5001 leaves the result alone: an empty text, anything after the value, or a value that is
// not finite.
[[nodiscard]] TZ_API int tzdbDisToF(wchar_t const* text, int unit, double* value);
[[nodiscard]] TZ_API int tzdbAngToF(wchar_t const* text, int unit, double* radians);
