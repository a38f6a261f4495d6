#include "host/text/text_escapes.h"

#include <algorithm>
#include <iterator>

#include "tz/text/string.h"

namespace tzhost {

namespace {

struct Escape {
    wchar_t letter;
    wchar_t character;
};

// The letter after the backslash, and the character that the escape stands for.
constexpr Escape kEscapes[] = {
    {L'n', L'\n'}, {L'r', L'\r'}, {L't', L'\t'}, {L's', L' '}, {L'\\', L'\\'},
};

constexpr std::size_t kHexDigits = 4;

int hexDigit(wchar_t c) {
    if (c >= L'0' && c <= L'9') return c - L'0';
    if (c >= L'A' && c <= L'F') return c - L'A' + 10;
    if (c >= L'a' && c <= L'f') return c - L'a' + 10;
    return -1;
}

std::optional<wchar_t> readHex(std::wstring_view digits) {
    if (digits.size() < kHexDigits) return std::nullopt;
    wchar_t value = 0;
    for (wchar_t const c : digits.substr(0, kHexDigits)) {
        if (hexDigit(c) < 0) return std::nullopt;
        value = value * 16 + hexDigit(c);
    }
    return value;
}

bool needsHex(wchar_t c) {
    return c < 0x20 || (c >= 0x7F && c < 0xA0);
}

}  // namespace

std::wstring escaped(std::wstring_view text) {
    std::wstring line;
    for (std::size_t i = 0; i < text.size(); ++i) {
        wchar_t const c = text[i];
        auto const row = std::find_if(std::begin(kEscapes), std::end(kEscapes),
                                      [c](Escape const& each) { return each.character == c; });
        bool const isInnerBlank = c == L' ' && i != 0 && i + 1 != text.size();
        if (row != std::end(kEscapes) && !isInnerBlank) {
            line += {L'\\', row->letter};
        } else if (needsHex(c)) {
            line += TzString::formatted(L"\\u%04X", c).str();
        } else {
            line += c;
        }
    }
    return line;
}

std::optional<std::wstring> unescaped(std::wstring_view line) {
    std::wstring text;
    for (std::size_t i = 0; i < line.size(); ++i) {
        if (line[i] != L'\\') {
            text += line[i];
            continue;
        }
        if (++i == line.size()) return std::nullopt;
        wchar_t const letter = line[i];
        auto const row =
            std::find_if(std::begin(kEscapes), std::end(kEscapes),
                         [letter](Escape const& each) { return each.letter == letter; });
        if (row != std::end(kEscapes)) {
            text += row->character;
            continue;
        }
        auto const value = letter == L'u' ? readHex(line.substr(i + 1)) : std::nullopt;
        if (!value) return std::nullopt;
        text += *value;
        i += kHexDigits;
    }
    return text;
}

}  // namespace tzhost
