#pragma once

// UTF-8 and the host's wide text. Overlong forms, surrogates and values above U+10FFFF are no
// UTF-8.

#include <cstddef>
#include <string>
#include <string_view>

namespace tzhost {

constexpr std::size_t kAllUtf8 = static_cast<std::size_t>(-1);

// The offset of the first byte that is no part of a well-formed character, or kAllUtf8.
[[nodiscard]] std::size_t firstBadByte(std::string_view bytes);

// Each byte that cannot be read becomes one U+FFFD.
[[nodiscard]] std::wstring fromUtf8(std::string_view bytes);

// A value that is no Unicode scalar is written as U+FFFD.
[[nodiscard]] std::string toUtf8(std::wstring_view text);

}  // namespace tzhost
