#pragma once

// Words on a line, with blanks or tabs between them.
//
//   for (std::wstring_view const word : splitWords(L" w 0,0 5,5"))
//       if (isSameWord(word, L"W")) ...

#include <string_view>
#include <vector>

namespace tzhost {

using Words = std::vector<std::wstring_view>;

// The words of a text, which must outlive them.
[[nodiscard]] Words splitWords(std::wstring_view text);
// Without the blanks and tabs before and after it.
[[nodiscard]] std::wstring_view withoutBlanksAround(std::wstring_view text);
// Without regard to case.
[[nodiscard]] bool isSameWord(std::wstring_view a, std::wstring_view b);

}  // namespace tzhost
