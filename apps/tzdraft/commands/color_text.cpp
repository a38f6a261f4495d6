#include "apps/tzdraft/commands/color_text.h"

#include <charconv>

#include "host/database/true_color.h"
#include "host/text/utf8.h"

namespace tzdraft {
namespace {

std::optional<int> readInteger(std::string_view digits) {
    int number = 0;
    auto const [end, problem] =
        std::from_chars(digits.data(), digits.data() + digits.size(), number);
    if (problem != std::errc() || end != digits.data() + digits.size()) return std::nullopt;
    return number;
}

}  // namespace

std::optional<TzCmColor> readColor(std::wstring_view text) {
    std::string const bytes = tzhost::toUtf8(text);
    if (auto const trueColor = tzhost::readTrueColor(bytes)) return trueColor;
    TzCmColor color;
    std::optional<int> const index = readInteger(bytes);
    if (!index || *index < 1 || *index > 255) return std::nullopt;
    if (color.setColorIndex(*index) != Tzad::eOk) return std::nullopt;
    return color;
}

std::wstring writeColor(TzCmColor const& color) {
    return color.isByColor() ? tzhost::fromUtf8(tzhost::trueColorText(color))
                             : std::to_wstring(color.colorIndex());
}

}  // namespace tzdraft
