#pragma once

// Stacks in what a word processor left, once it was normalised: each text `\S1/2;`, whatever looks
// the program gave to parts of it, becomes the stack that a module reads, in the look of its start;
// backslashes that stand doubled before an "S" become one.
//
//   std::string const document = withStacks(normaliseRtf(bytes).document);

#include <string>
#include <string_view>

namespace tzhost {

// In time linear in the document.
[[nodiscard]] std::string withStacks(std::string_view document);

}  // namespace tzhost
