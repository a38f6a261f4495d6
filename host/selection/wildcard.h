#pragma once

#include <string_view>

// Names against patterns, as filters and lists of names use them.
namespace tzhost {

enum class Case { exact, ignored };

// Whether the whole text matches one of the patterns that `patterns` lists with commas between
// them: "*" is any text, "?" any character, "[abx-z]" one of these, "[~abx-z]" none of these, and a
// pattern after "~" is any text that does not match it. A "[" without an end stands for itself.
// Takes time by the product of the two lengths at most.
[[nodiscard]] bool matchesPattern(std::wstring_view text, std::wstring_view patterns, Case letters);

}  // namespace tzhost
