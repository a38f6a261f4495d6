#include "module/markup/read_markup/markup_numbers.h"

#include "module/markup/shared/wrapping.h"
#include "tz/text/code_page.h"

namespace {

constexpr int kUSequenceTail = 5;  // the plus sign and four digits after `\U`

}  // namespace

int GetNumber(wchar_t const*& cursor) {
    int value = 0;
    for (; isDigit(*cursor); ++cursor)
        value = withDigit(value, *cursor - L'0');
    if (*cursor == L';') ++cursor;
    return value;
}

double GetRealNumber(wchar_t const*& cursor, signed char* pbRelative, bool bEatSemicolon) {
    bool const isNegative = *cursor == L'-';
    if (isNegative) ++cursor;
    double value = 0.0;
    for (; isDigit(*cursor); ++cursor)
        value = value * 10 + (*cursor - L'0');
    if (*cursor == L'.') {
        ++cursor;
        for (double divisor = 10.0; isDigit(*cursor); ++cursor, divisor *= 10)
            value += (*cursor - L'0') / divisor;
    }
    bool const isRelative = *cursor == L'x' || *cursor == L'X';
    if (isRelative) ++cursor;
    if (bEatSemicolon && *cursor == L';') ++cursor;
    if (pbRelative) *pbRelative = isRelative;
    return isNegative ? -value : value;
}

CStdStrW GetString(wchar_t const*& cursor) {
    CStdStrW text;
    while (*cursor != 0 && *cursor != L';') {
        if (*cursor == L'\\') {
            text += *cursor++;
            text += *cursor;
            if (*cursor == 0 || *++cursor == 0) return text;
        }
        text += *cursor++;
    }
    if (*cursor == L';') ++cursor;
    return text;
}

int Get4ByteHexValue(wchar_t const*& cursor) {
    if (*cursor != 0) ++cursor;
    int value = 0;
    for (int i = 0; i < 4; ++i) {
        if (*cursor == 0) return 0;
        int const digit = hexDigitValue(*cursor++);
        if (digit < 0) return 0;
        value = value * 16 + digit;
    }
    return value;
}

bool ConvertUSequence(wchar_t const* s, CStdStrW& out, signed char bHex) {
    out.clear();
    if (bHex) {
        int value = 0;
        for (int i = 0; i < 4; ++i) {
            int const digit = hexDigitValue(s[i]);
            if (digit < 0) return false;
            value = value * 16 + digit;
        }
        out.Fmt(L"\\u%d?", value);
        return true;
    }
    bool const isNegative = s[0] == L'-';
    int value = 0;
    int at = isNegative ? 1 : 0;
    for (; isDigit(s[at]) && at < kUSequenceTail; ++at)
        value = withDigit(value, s[at] - L'0');
    if (s[at] != L'?') return false;
    out.Fmt(L"\\U+%04X", isNegative ? wrappingNegative(value) : value);
    return true;
}

CStdStrW ConvertMTextUSequence(wchar_t const*& cursor) {
    int code = 0;
    getCIF(cursor - 2, code);
    for (int i = 0; i < kUSequenceTail && *cursor != 0; ++i)
        ++cursor;
    CStdStrW text;
    text.Fmt(L"\\u%d?", code);
    return text;
}
