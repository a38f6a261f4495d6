#pragma once

// Bytes of a code page to text and back, by the C library's iconv. A page that it does not know,
// and UTF-8 (65001), which old texts never mean, are read as the system page. Bytes below 0x80 are
// ASCII in every page.

#include <optional>
#include <string>
#include <string_view>

namespace tzhost {

// The page that is used when `codePage` is asked for: that page, or the system page when the host
// cannot use it.
[[nodiscard]] int usablePage(int codePage);

// Nothing when some bytes are no character of the page.
[[nodiscard]] std::optional<std::wstring> decode(int codePage, std::string_view bytes);

// A character that the page lacks becomes "?".
[[nodiscard]] std::string encode(int codePage, std::wstring_view text);

}  // namespace tzhost
