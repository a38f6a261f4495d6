#include "module/markup/read_rtf/rtf_tokens.h"

#include "module/markup/shared/wrapping.h"

std::wstring_view readControlWord(wchar_t const*& cursor, int& value) {
    wchar_t const* const start = cursor;
    while (*cursor >= L'a' && *cursor <= L'z')
        ++cursor;
    std::wstring_view const word(start, static_cast<std::size_t>(cursor - start));
    value = kNoValue;
    bool const isNegative = *cursor == L'-';
    if (isNegative || isDigit(*cursor)) {
        if (isNegative) ++cursor;
        int number = 0;
        for (; isDigit(*cursor); ++cursor)
            number = withDigit(number, *cursor - L'0');
        value = isNegative ? wrappingNegative(number) : number;
    }
    if (*cursor == L' ') ++cursor;
    return word;
}

void IgnoreToMatchingBrace(wchar_t const*& cursor) {
    for (long long depth = 0; *cursor != 0; ++cursor) {
        if (*cursor == L'\\') {
            ++cursor;
            if (*cursor == 0) return;
        } else if (*cursor == L'{') {
            ++depth;
        } else if (*cursor == L'}') {
            if (depth == 0) return;
            --depth;
        }
    }
}

void skipGroupRest(wchar_t const*& cursor) {
    IgnoreToMatchingBrace(cursor);
    if (*cursor != 0) ++cursor;
}
