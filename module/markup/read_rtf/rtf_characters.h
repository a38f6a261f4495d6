#pragma once

#include <string>

#include "tz/text/code_page.h"
#include "tz/text/std_str.h"

// Characters of rich text, decoded from its byte escapes through a code page. Tabs, line feeds and
// carriage returns between the bytes of one character do not count, as rich text is broken into
// lines anywhere. No function steps past the terminating zero.
//
//   wchar_t const* cursor = L"b0\\'a1x";                  // after the \'
//   WideCharacterString(cursor, code_page_id_ex(936));    // one character; the cursor is on "x"

[[nodiscard]] constexpr bool isRtfWhiteSpace(wchar_t c) {
    return c == L'\t' || c == L'\n' || c == L'\r';
}
void skipRtfWhiteSpace(wchar_t const*& cursor);

// The value of one hex digit, which is consumed; 0 for any other character, which is consumed too.
[[nodiscard]] int GetHexDigit(wchar_t const*& cursor);
// Two hex digits as a byte; 0 at the end of the text.
[[nodiscard]] int locGetHexChar(wchar_t const*& cursor);
// The byte after a `\'`, with a trail byte in its low bits when it is a lead byte of the page and
// one follows: as a further escape, as an escaped backslash or bare.
[[nodiscard]] int WideCharacter(wchar_t const*& cursor, code_page_id page);
// The same as text; bytes that are no one character of the page are widened one by one.
[[nodiscard]] CStdStrW WideCharacterString(wchar_t const*& cursor, code_page_id_ex page);
// The high byte of the value, unless it is 0, and the low one.
[[nodiscard]] std::string DoubleByteString(int value);
// The bytes of the next character, bare or escaped. Empty at the end of the text, and after a
// backslash that is followed by something else than a backslash or quote, which is not consumed.
[[nodiscard]] std::string GetCharacterMBCS(wchar_t const*& cursor, code_page_id page);
// The same as text; bytes that the page cannot decode are widened one by one.
[[nodiscard]] CStdStrW GetCharacter(wchar_t const*& cursor, code_page_id_ex page);
