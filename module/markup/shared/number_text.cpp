#include "module/markup/shared/number_text.h"

#include <array>
#include <charconv>

namespace {

constexpr wchar_t kHexDigits[] = L"0123456789ABCDEF";

}  // namespace

void appendDecimal(std::wstring& text, long long value) {
    std::array<char, 20> digits{};
    char const* const end = std::to_chars(digits.data(), digits.data() + digits.size(), value).ptr;
    text.append(static_cast<char const*>(digits.data()), end);
}

void appendReal(std::wstring& text, double value, int digits) {
    std::array<char, 32> room{};
    char const* const end = std::to_chars(room.data(), room.data() + room.size(), value,
                                          std::chars_format::general, digits)
                                .ptr;
    text.append(static_cast<char const*>(room.data()), end);
}

void appendHex4(std::wstring& text, unsigned int value) {
    int shift = 12;
    while (shift < 28 && (value >> (shift + 4)) != 0)
        shift += 4;
    for (; shift >= 0; shift -= 4)
        text += kHexDigits[(value >> shift) & 0xF];
}
