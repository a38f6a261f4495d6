#pragma once

#include <string_view>

// Families of fonts in rich text: a word each, and a number in the bits 4 to 7 of pitch and family.

// 0 for a word of no family, as for "fnil".
[[nodiscard]] int familyOf(std::wstring_view word);
// "fnil" for a number that no word stands for.
[[nodiscard]] wchar_t const* familyWord(int pitchAndFamily);
