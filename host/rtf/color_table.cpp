#include "host/rtf/color_table.h"

#include <utility>

namespace tzhost {

namespace {

struct ComponentRow {
    std::string_view word;
    int shift;
};
constexpr ComponentRow kComponents[] = {
    {"red", 0},
    {"green", 8},
    {"blue", 16},
};

}  // namespace

void RtfColorTable::takeWord(std::string_view word, int value) {
    for (ComponentRow const& row : kComponents) {
        if (row.word != word) continue;
        unsigned int const mask = 0xFFU << row.shift;
        color_ &= ~kAutomatic & ~mask;
        color_ |= (static_cast<unsigned int>(value) & 0xFF) << row.shift;
    }
}

void RtfColorTable::endColor() {
    colors_.push_back(std::exchange(color_, kAutomatic));
}

std::optional<unsigned int> RtfColorTable::find(int number) const {
    if (number < 0 || static_cast<std::size_t>(number) >= colors_.size()) return {};
    unsigned int const color = colors_[static_cast<std::size_t>(number)];
    return color == kAutomatic ? std::nullopt : std::optional(color);
}

}  // namespace tzhost
