#pragma once

// The one table of escapes in tables of texts, for reader and writer: `\n`, `\r`, `\t`, `\\`, `\s`
// (a blank at an end of a text, which would not be seen) and `\uXXXX` for any other control
// character.

#include <optional>
#include <string>
#include <string_view>

namespace tzhost {

// The text as one line without control characters.
[[nodiscard]] std::wstring escaped(std::wstring_view text);

// The text that a line means; nothing when a backslash opens no escape.
[[nodiscard]] std::optional<std::wstring> unescaped(std::wstring_view line);

}  // namespace tzhost
