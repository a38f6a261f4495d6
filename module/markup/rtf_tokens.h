#pragma once

#include <climits>
#include <string_view>

// What rich text is made of, below what its words mean: control words and groups. Every function
// moves a cursor on and stops at the terminating zero.
//
//   wchar_t const* cursor = L"fs28 x";              // behind the backslash
//   int value;
//   std::wstring_view word = readControlWord(cursor, value);   // "fs", 28; the cursor is on "x"

// The value of a word without a number.
inline constexpr int kNoValue = INT_MIN;

// The small letters at the cursor, which stands behind a backslash, the number behind them and one
// blank. Empty when no letter stands there, though a number may. The view is into the text.
[[nodiscard]] std::wstring_view readControlWord(wchar_t const*& cursor, int& value);

// To the "}" that closes the group in which the cursor stands, but not over it. Escaped braces do
// not count.
void IgnoreToMatchingBrace(wchar_t const*& cursor);

// From a "{" behind the end of its group.
void skipGroup(wchar_t const*& cursor);
