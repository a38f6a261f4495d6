#include "apps/tzdraft/commands/color_text.h"

#include <charconv>

#include "host/base/utf8.h"
#include "tz/text/string.h"

namespace tzdraft {
namespace {

std::optional<int> readInteger(std::string_view digits, int base) {
    int number = 0;
    auto const [end, problem] =
        std::from_chars(digits.data(), digits.data() + digits.size(), number, base);
    if (problem != std::errc() || end != digits.data() + digits.size()) return std::nullopt;
    return number;
}

}  // namespace

std::optional<TzCmColor> readColor(std::wstring_view text) {
    std::string const bytes = tzhost::toUtf8(text);
    TzCmColor color;
    if (bytes.size() == 7 && bytes[0] == '#') {
        std::optional<int> const rgb = readInteger(std::string_view(bytes).substr(1), 16);
        if (!rgb || *rgb < 0) return std::nullopt;
        color.setRGB(static_cast<std::uint8_t>(*rgb >> 16), static_cast<std::uint8_t>(*rgb >> 8),
                     static_cast<std::uint8_t>(*rgb));
        return color;
    }
    std::optional<int> const index = readInteger(bytes, 10);
    if (!index || color.setColorIndex(*index) != Tzad::eOk) return std::nullopt;
    return color;
}

std::wstring writeColor(TzCmColor const& color) {
    TzString text;
    if (color.isByColor())
        return text.format(L"#%02X%02X%02X", color.red(), color.green(), color.blue()).str();
    return text.format(L"%d", color.colorIndex()).str();
}

}  // namespace tzdraft
