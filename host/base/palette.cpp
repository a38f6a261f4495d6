#include "host/base/palette.h"

#include <array>
#include <limits>

namespace tzhost {

namespace {

constexpr std::uint32_t pack(int red, int green, int blue) {
    return static_cast<std::uint32_t>(red | (green << 8) | (blue << 16));
}

constexpr int kFirstWheelIndex = 10;
constexpr int kFirstGrey = 250;
// Twentieths of full brightness, by the index's last digit over 2.
constexpr std::array<int, 5> kBrightness{20, 16, 12, 9, 6};
constexpr std::array<std::uint32_t, kFirstWheelIndex> kNamed{
    pack(0, 0, 0),       pack(255, 0, 0),     pack(255, 255, 0), pack(0, 255, 0),
    pack(0, 255, 255),   pack(0, 0, 255),     pack(255, 0, 255), pack(255, 255, 255),
    pack(128, 128, 128), pack(192, 192, 192),
};

// A colour of the hue wheel: 24 hues 15 degrees apart, so that each sixth of the wheel has four
// steps and all arithmetic is exact in whole numbers. Components are cut, not rounded.
constexpr std::uint32_t wheelColor(int index) {
    int const step = index / 10 - 1;
    int const sixth = step / 4;
    int const within = step % 4;
    int const saturation = index % 2 == 0 ? 2 : 1;  // halves
    int const brightness = kBrightness[static_cast<std::size_t>(index % 10 / 2)];
    auto const component = [&](int eighths) { return 255 * brightness * eighths / (20 * 8); };
    int const full = component(8);
    int const low = component(8 - saturation * 4);
    int const falling = component(8 - saturation * within);
    int const rising = component(8 - saturation * (4 - within));
    switch (sixth) {
    case 0: return pack(full, rising, low);
    case 1: return pack(falling, full, low);
    case 2: return pack(low, full, rising);
    case 3: return pack(low, falling, full);
    case 4: return pack(rising, low, full);
    default: return pack(full, low, falling);
    }
}

constexpr auto kPalette = [] {
    std::array<std::uint32_t, kLastPaletteIndex + 1> colors{};
    for (int i = 0; i <= kLastPaletteIndex; ++i) {
        auto const at = static_cast<std::size_t>(i);
        int const grey = 40 * (i - kFirstGrey + 1);
        colors[at] = i < kFirstWheelIndex ? kNamed[at]
                     : i < kFirstGrey     ? wheelColor(i)
                                          : pack(grey, grey, grey);
    }
    return colors;
}();

int squaredDistance(std::uint32_t a, std::uint32_t b) {
    int sum = 0;
    for (int shift = 0; shift <= 16; shift += 8) {
        int const difference =
            static_cast<int>((a >> shift) & 0xFF) - static_cast<int>((b >> shift) & 0xFF);
        sum += difference * difference;
    }
    return sum;
}

int searchNearest(std::uint32_t rgb) {
    int nearest = 1;
    int least = std::numeric_limits<int>::max();
    for (int i = 1; i <= kLastPaletteIndex; ++i) {
        int const distance = squaredDistance(paletteColor(i), rgb);
        if (distance >= least) continue;
        least = distance;
        nearest = i;
        if (distance == 0) break;
    }
    return nearest;
}

// One remembered answer. Index 0 marks an empty place, since no search gives 0.
struct Remembered {
    std::uint32_t rgb = 0;
    int index = 0;
};

}  // namespace

std::uint32_t paletteColor(int index) {
    return index < 0 || index > kLastPaletteIndex ? 0 : kPalette[static_cast<std::size_t>(index)];
}

int nearestPaletteIndex(std::uint32_t rgb) {
    static std::array<Remembered, 4096> memory;
    std::uint32_t const color = rgb & 0xFFFFFF;
    Remembered& place = memory[(color * 2654435761U) >> 20];
    if (place.index == 0 || place.rgb != color) place = {color, searchNearest(color)};
    return place.index;
}

}  // namespace tzhost
