#pragma once

// The host's fixed palette of 256 colours, and the search for the nearest. Colours are 0x00BBGGRR.

#include <cstdint>

namespace tzhost {

constexpr int kLastPaletteIndex = 255;

// Black for 0 and for an index outside the palette.
[[nodiscard]] std::uint32_t paletteColor(int index);

// The lowest of the indices 1 to 255 at the least squared distance of components. Answers are
// remembered, so that a colour is searched for once as long as few colours are in use.
[[nodiscard]] int nearestPaletteIndex(std::uint32_t rgb);

}  // namespace tzhost
