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

// The page of a character set, and the set of a page. Each gives 0 when the table has no answer.
[[nodiscard]] int codePageOf(Charset charset);
[[nodiscard]] Charset charsetOf(int codePage);

[[nodiscard]] bool isLeadByte(int codePage, unsigned char byte);
// Whether the page has characters of two bytes, the first of which is a lead byte.
[[nodiscard]] bool hasLeadBytes(int codePage);

// The name under which to ask iconv for the page; iconv may not know the page.
[[nodiscard]] std::string iconvNameOf(int codePage);

}  // namespace tzhost
