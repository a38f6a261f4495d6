#pragma once

// The rich text of a module as a word processor gets it. Word processors know nothing of stacks and
// of colours beside the page's, and read numbers of 16 bits:
//
//   - a stack stands as the code that it has in markup, `\S1/2;`, in its own size, and backslashes
//     of the text that would make one of an "S" stand doubled;
//   - characters above U+FFFF are pairs of `\u` words;
//   - white, the colour of the page, is the nearest that can be seen;
//   - the document's style is the look that the text starts in, which is then that of new text and
//     of scripts for which programs keep looks of their own.
//
//   std::string const file = sentRtf(document);
//   std::vector<DialectFont> const fonts = fontsOf(file);

#include <string>
#include <string_view>
#include <vector>

#include "host/rtf/dialect_writer.h"

namespace tzhost {

// Colours as 0x00BBGGRR.
inline constexpr unsigned int kWhite = 0xFFFFFF;
inline constexpr unsigned int kShownWhite = 0x010101;

// ASCII, in time linear in the document.
[[nodiscard]] std::string sentRtf(std::wstring_view document);

// The fonts of a document that was sent, by number; the first is the one that the text starts in.
[[nodiscard]] std::vector<DialectFont> fontsOf(std::string_view sent);

}  // namespace tzhost
