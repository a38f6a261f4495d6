#pragma once

#include <string>

namespace markuptest {

// The characters of a markup, a line for each paragraph. Knows the codes that the reader writes.
[[nodiscard]] std::wstring visibleText(std::wstring const& markup);

}  // namespace markuptest
