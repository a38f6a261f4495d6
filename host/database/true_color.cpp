#include "host/database/true_color.h"

#include <charconv>

#include "tz/text/string.h"

namespace tzhost {

std::string trueColorText(TzCmEntityColor const& color) {
    return TzString::formatted(L"#%02X%02X%02X", color.red(), color.green(), color.blue()).toUtf8();
}

std::optional<TzCmEntityColor> readTrueColor(std::string_view text) {
    constexpr std::size_t kLength = 7;
    constexpr int kHexadecimal = 16;
    unsigned int rgb = 0;
    if (text.size() != kLength || text[0] != '#') return std::nullopt;
    char const* const end = text.data() + kLength;
    auto const [stop, error] = std::from_chars(text.data() + 1, end, rgb, kHexadecimal);
    if (error != std::errc() || stop != end) return std::nullopt;
    auto const part = [=](unsigned int shift) {
        return static_cast<std::uint8_t>(rgb >> shift & 0xFFU);
    };
    return TzCmEntityColor(part(16), part(8), part(0));
}

}  // namespace tzhost
