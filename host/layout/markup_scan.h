#pragma once

#include <string>

// The small readers that the markup's codes are made of. Each moves the caller's cursor over a text
// that ends with zero and never passes that zero. None follows a locale and none reports an error:
// what is not there reads as 0 or as empty.
namespace tzhost::markup {

// Digits, then one optional ";". No sign; without digits 0, nothing but a ";" being taken. What
// does not fit wraps around 32 bits.
[[nodiscard]] int scanNumber(wchar_t const*& cursor);

// A real as the codes write it, and whether an "x" after it made it a factor.
struct ScannedReal {
    double value = 0.0;
    bool relative = false;
};

// A "-", digits, a "." with digits, an "x" of either case, all optional; no exponent.
[[nodiscard]] ScannedReal scanReal(wchar_t const*& cursor);

// Steps over one ";" if the cursor stands on it.
void skipSemicolon(wchar_t const*& cursor);

// The text up to an unescaped ";", which is taken too. A backslash and its character are copied as
// a pair, and the character after such a pair is copied whatever it is, so a ";" there ends
// nothing.
[[nodiscard]] std::wstring scanEscapedText(wchar_t const*& cursor);

// How many characters follow the letter of a Unicode code: a plus sign and four digits.
inline constexpr unsigned int kUnicodeArguments = 5;

// With the cursor after "\U": the character of "+XXXX" (four hex digits), or 0 when something else
// stands there. Five characters are taken either way, as far as the text goes.
[[nodiscard]] wchar_t scanUnicode(wchar_t const*& cursor);

// With the cursor after "\M": the character of "+nXXXX", n from 1 to 5 choosing one of the
// double-byte code pages 932, 936, 949, 950 and 1361. False, and the cursor stays, when something
// else stands there. Bytes that are no character of the page read as U+FFFD.
[[nodiscard]] bool scanMultibyte(wchar_t const*& cursor, wchar_t& character);

}  // namespace tzhost::markup
