// The codes of single characters in the markup of texts: `\U+XXXX` and `\M+nXXXX`.

#include <array>

#include "tz/text/code_page.h"

namespace {

constexpr int kDigits = 4;

// The pages that the digits 1 to 5 of `\M+n` stand for.
constexpr std::array<code_page_id, 5> kPages{kCodePage932, kCodePage936, kCodePage949, kCodePage950,
                                             kCodePage1361};

// The value of four hex digits; -1 without them. Stops at the first character that is no hex digit,
// so it never reads past the end of a text.
int readDigits(wchar_t const* text) {
    int value = 0;
    for (int i = 0; i < kDigits; ++i) {
        wchar_t const c = tzToLower(text[i]);
        bool const isDigit = c >= L'0' && c <= L'9';
        if (!isDigit && (c < L'a' || c > L'f')) return -1;
        value = value * 16 + (isDigit ? c - L'0' : c - L'a' + 10);
    }
    return value;
}

}  // namespace

bool getCIF(wchar_t const* text, int& code) {
    code = 0;
    if (text[0] != L'\\' || (text[1] != L'U' && text[1] != L'u') || text[2] != L'+') return false;
    int const value = readDigits(text + 3);
    if (value < 0) return false;
    code = value;
    return true;
}

bool getCIF(wchar_t const* text) {
    int code = 0;
    return getCIF(text, code);
}

bool getMIF(wchar_t const* text, code_page_id& page, int& code) {
    page = kCodePageUnknown;
    code = 0;
    if (text[0] != L'\\' || (text[1] != L'M' && text[1] != L'm') || text[2] != L'+') return false;
    if (text[3] < L'1' || text[3] > L'5') return false;
    int const value = readDigits(text + 4);
    if (value < 0) return false;
    page = kPages[static_cast<std::size_t>(text[3] - L'1')];
    code = value;
    return true;
}

bool getMIF(wchar_t const* text) {
    code_page_id page = kCodePageUnknown;
    int code = 0;
    return getMIF(text, page, code);
}
