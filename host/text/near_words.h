#pragma once

#include <string>
#include <string_view>
#include <vector>

// What a mistyped word was probably meant to be.
namespace tzhost {

// The first word that the least number of changed, added, left out or exchanged letters leads to,
// without regard to case. One slip makes a word of up to four letters another, two a longer one.
// When none is that near, the shortest that begins so; else empty.
[[nodiscard]] std::wstring nearestWord(std::wstring_view typed,
                                       std::vector<std::wstring> const& words);

}  // namespace tzhost
