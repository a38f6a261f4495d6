#pragma once

#include "tz/text/code_page.h"
#include "tz/text/std_str.h"

// Characters written as escapes of rich text, one for each byte.
//
//   Handle8Bits(L'A')      // A
//   Handle8Bits(0xE9)      // \'e9

// The escape of the low eight bits of a character.
[[nodiscard]] CStdStrW Expand8Bits(wchar_t c);
// The escape for a character with any of the bits 7 to 15, of its low eight bits alone; any other
// character as it is.
[[nodiscard]] CStdStrW Handle8Bits(wchar_t c);
// Two characters as one of a double-byte font. The cursor stops at the end of the text.
[[nodiscard]] CStdStrW ExpandDoubleByte(wchar_t const*& cursor);
// A text in the bytes of a page, those above 0x7F as escapes.
[[nodiscard]] CStdStrW HandleEscaped8Bits(CStdStrW s, code_page_id page);
