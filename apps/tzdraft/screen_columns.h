#pragma once

#include <cstddef>

namespace tzdraft {

// How wide the terminal is that the descriptor leads to; 0 where there is none.
[[nodiscard]] std::size_t screenColumns(int descriptor);

}  // namespace tzdraft
