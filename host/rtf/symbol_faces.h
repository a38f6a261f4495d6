#pragma once

// Faces whose characters are symbols at the places of letters: what Unicode calls those symbols.

#include <string_view>

namespace tzhost {

enum class SymbolFace { none, symbol, wingdings };

[[nodiscard]] SymbolFace symbolFaceOf(std::wstring_view name);

// A document may have such characters at U+F000 to U+F0FF. Others, and those without a name of
// their own, come back as they are.
[[nodiscard]] wchar_t unicodeOf(SymbolFace face, wchar_t c);

inline constexpr wchar_t kFirstSymbol = 0xF000;
inline constexpr wchar_t kLastSymbol = 0xF0FF;

}  // namespace tzhost
