#pragma once

#include <string>
#include <string_view>

// Markup as plain editors show it: one paragraph a line. The code for a paragraph's end becomes a
// line break; a line break in the markup itself becomes `\U+000A`, and both turn back. An escaped
// backslash is never taken for the start of a code.
//
//   markupToLines(L"A\\PB")      // "A", line break, "B"
//   linesToMarkup(L"A\nB\n")     // A\PB: one line break at the end is the file's own
namespace tzhost {

[[nodiscard]] std::wstring markupToLines(std::wstring_view markup);
[[nodiscard]] std::wstring linesToMarkup(std::wstring_view lines);

}  // namespace tzhost
