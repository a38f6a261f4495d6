#pragma once

#include "tz/text/std_str.h"

// Numbers and texts of the MTEXT markup, read over a cursor that each function advances. No
// function steps past the terminating zero, and none fails: a number that is missing reads as 0.
//
//   wchar_t const* cursor = L"12;x";
//   int const color = GetNumber(cursor);   // 12, and the cursor stands on "x"
//
// Numbers follow no locale; integers wrap at 32 bits.

// Digits, and one ";" after them. No sign.
[[nodiscard]] int GetNumber(wchar_t const*& cursor);

// An optional "-", digits, "." and digits, an optional "x" or "X" and, if asked for, one ";". There
// is no "+" and no exponent. `pbRelative`, which may be null, takes whether the "x" was there.
[[nodiscard]] double
GetRealNumber(wchar_t const*& cursor, signed char* pbRelative, bool bEatSemicolon);

// The text up to the first ";" that is not escaped; that ";" is consumed. The character after an
// escape pair is copied without being looked at, and a backslash that ends the text gives a zero
// after it.
[[nodiscard]] CStdStrW GetString(wchar_t const*& cursor);

// The value of the four hex digits after the character at the cursor, which then stands after
// them; with fewer digits 0, and the cursor after the first character that is none.
[[nodiscard]] int Get4ByteHexValue(wchar_t const*& cursor);

// A rich text code to a markup one (`bHex` zero: `s` stands after "\u", the digits end at a "?"
// among the next five characters) or back (`bHex` non-zero: `s` starts with four hex digits). False
// when `s` is neither.
[[nodiscard]] bool ConvertUSequence(wchar_t const* s, CStdStrW& out, signed char bHex);

// The rich text code of the `\U+XXXX` after whose "U" the cursor stands; the code is 0 when it is
// malformed. Five characters are stepped over whatever they are.
[[nodiscard]] CStdStrW ConvertMTextUSequence(wchar_t const*& cursor);
