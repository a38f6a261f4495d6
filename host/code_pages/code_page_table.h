#pragma once

// What the host knows of code pages by number: character sets, lead bytes, names for iconv.

#include <string>

#include "tz/text/charset.h"

namespace tzhost {

constexpr int kDefaultCodePage = 1252;
constexpr int kUtf8CodePage = 65001;

// The number at the end of the variable SYSCODEPAGE, such as 1252 of "ANSI_1252"; 1252 when it has
// none.
[[nodiscard]] int systemCodePage();

// The page of a set, 0 without one. The page 0 has no set; a page without a set of its own gives 0.
[[nodiscard]] int codePageOf(Charset charset);
[[nodiscard]] Charset charsetOf(int codePage);

[[nodiscard]] bool isLeadByte(int codePage, unsigned char byte);
// Whether the page has characters of two bytes that open with a lead byte.
[[nodiscard]] bool hasLeadBytes(int codePage);

// What iconv may call the page; it need not know it.
[[nodiscard]] std::string iconvNameOf(int codePage);

}  // namespace tzhost
