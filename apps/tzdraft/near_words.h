#pragma once

#include <string>
#include <string_view>
#include <vector>

// What a mistyped word was probably meant to be.
namespace tzdraft {

// The first word that the least number of changed, added, left out or exchanged letters leads to,
// without regard to case; empty when none is near. One slip makes a word of up to four letters
// another, two a longer one.
[[nodiscard]] std::wstring nearestWord(std::wstring_view typed,
                                       std::vector<std::wstring> const& words);

}  // namespace tzdraft
