#include "host/layout/markup_scan.h"

#include <iconv.h>

#include <array>
#include <cstdint>

namespace tzhost::markup {
namespace {

// The code pages behind the digits 1 to 5 of a multibyte code, by the names that iconv knows.
constexpr std::array<char const*, 5> kMultibytePages{"CP932", "CP936", "CP949", "CP950", "JOHAB"};

constexpr int kHexDigits = 4;

bool isDigit(wchar_t c) {
    return c >= L'0' && c <= L'9';
}

int hexValue(wchar_t c) {
    if (isDigit(c)) {
        return c - L'0';
    }
    if (c >= L'a' && c <= L'f') {
        return c - L'a' + 10;
    }
    return c >= L'A' && c <= L'F' ? c - L'A' + 10 : -1;
}

// The value of four hex digits, or -1.
int fourHexDigits(wchar_t const* text) {
    int value = 0;
    for (int i = 0; i < kHexDigits; ++i) {
        int const digit = hexValue(text[i]);
        if (digit < 0) {
            return -1;
        }
        value = value * 16 + digit;
    }
    return value;
}

wchar_t decodeBytes(char const* page, int code) {
    iconv_t const converter = iconv_open("UCS-4LE", page);
    if (converter == reinterpret_cast<iconv_t>(-1)) {
        return L'\uFFFD';
    }
    std::array<char, 2> bytes{static_cast<char>(code >> 8), static_cast<char>(code & 0xFF)};
    std::size_t const lead = bytes[0] == 0 ? 1 : 0;
    char* in = bytes.data() + lead;
    std::size_t inLeft = bytes.size() - lead;
    std::array<unsigned char, 4> result{};
    char* out = reinterpret_cast<char*>(result.data());
    std::size_t outLeft = result.size();
    std::size_t const failed = iconv(converter, &in, &inLeft, &out, &outLeft);
    iconv_close(converter);
    if (failed == static_cast<std::size_t>(-1) || outLeft != 0) {
        return L'\uFFFD';
    }
    std::uint32_t const value = result[0] | (std::uint32_t{result[1]} << 8) |
                                (std::uint32_t{result[2]} << 16) | (std::uint32_t{result[3]} << 24);
    return static_cast<wchar_t>(value);
}

}  // namespace

int scanNumber(wchar_t const*& cursor) {
    unsigned int value = 0;
    while (isDigit(*cursor)) {
        value = value * 10U + static_cast<unsigned int>(*cursor - L'0');
        ++cursor;
    }
    skipSemicolon(cursor);
    return static_cast<int>(value);
}

ScannedReal scanReal(wchar_t const*& cursor) {
    bool const negative = *cursor == L'-';
    if (negative) {
        ++cursor;
    }
    ScannedReal real;
    for (; isDigit(*cursor); ++cursor) {
        real.value = real.value * 10.0 + (*cursor - L'0');
    }
    if (*cursor == L'.') {
        double divisor = 10.0;
        for (++cursor; isDigit(*cursor); ++cursor) {
            real.value += (*cursor - L'0') / divisor;
            divisor *= 10.0;
        }
    }
    if (negative) {
        real.value = -real.value;
    }
    real.relative = *cursor == L'x' || *cursor == L'X';
    if (real.relative) {
        ++cursor;
    }
    return real;
}

void skipSemicolon(wchar_t const*& cursor) {
    if (*cursor == L';') {
        ++cursor;
    }
}

std::wstring scanEscapedText(wchar_t const*& cursor) {
    std::wstring text;
    while (*cursor != 0 && *cursor != L';') {
        bool const pair = *cursor == L'\\';
        text += *cursor++;
        // Of a pair, its character and the one behind it are taken unseen.
        for (int i = 0; pair && i < 2 && *cursor != 0; ++i) {
            text += *cursor++;
        }
    }
    skipSemicolon(cursor);
    return text;
}

wchar_t scanUnicode(wchar_t const*& cursor) {
    int const value = *cursor == L'+' ? fourHexDigits(cursor + 1) : -1;
    for (int i = 0; i <= kHexDigits && *cursor != 0; ++i) {
        ++cursor;
    }
    return value < 0 ? 0 : static_cast<wchar_t>(value);
}

bool scanMultibyte(wchar_t const*& cursor, wchar_t& character) {
    if (cursor[0] != L'+' || cursor[1] < L'1' || cursor[1] > L'5') {
        return false;
    }
    int const code = fourHexDigits(cursor + 2);
    if (code < 0) {
        return false;
    }
    character = decodeBytes(kMultibytePages[static_cast<std::size_t>(cursor[1] - L'1')], code);
    cursor += 2 + kHexDigits;
    return true;
}

}  // namespace tzhost::markup
