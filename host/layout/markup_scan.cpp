#include "host/layout/markup_scan.h"

#include <string>

#include "tz/text/code_page.h"

namespace tzhost::markup {
namespace {

constexpr int kMultibyteArguments = 6;  // what follows the "M": "+nXXXX"

bool isDigit(wchar_t c) {
    return c >= L'0' && c <= L'9';
}

wchar_t decodeCharacter(code_page_id page, int code) {
    std::string bytes;
    if (code > 0xFF) {
        bytes += static_cast<char>(code >> 8);
    }
    bytes += static_cast<char>(code & 0xFF);
    CStdStrW text;
    bool const decoded = UnicodeConvert::multibyteToWide(page, bytes, text);
    return decoded && text.size() == 1 ? text[0] : L'\uFFFD';
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
        // The character of a pair and the one after it are taken whatever they are.
        for (int i = 0; pair && i < 2 && *cursor != 0; ++i) {
            text += *cursor++;
        }
    }
    skipSemicolon(cursor);
    return text;
}

wchar_t scanUnicode(wchar_t const*& cursor) {
    int code = 0;
    (void)getCIF(cursor - 2, code);  // without a code it gives 0
    for (unsigned int i = 0; i < kUnicodeArguments && *cursor != 0; ++i) {
        ++cursor;
    }
    return static_cast<wchar_t>(code);
}

bool scanMultibyte(wchar_t const*& cursor, wchar_t& character) {
    code_page_id page = kCodePageUnknown;
    int code = 0;
    if (!getMIF(cursor - 2, page, code)) {
        return false;
    }
    character = decodeCharacter(page, code);
    cursor += kMultibyteArguments;
    return true;
}

}  // namespace tzhost::markup
