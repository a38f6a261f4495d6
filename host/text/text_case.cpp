#include "host/text/case_table.h"
#include "tz/text/string.h"

wchar_t tzToLower(wchar_t c) {
    return tzhost::lowerOf(c);
}

wchar_t tzToUpper(wchar_t c) {
    return tzhost::upperOf(c);
}

int tzCompareNoCase(wchar_t const* a, wchar_t const* b) {
    wchar_t const* left = a ? a : L"";
    wchar_t const* right = b ? b : L"";
    for (;; ++left, ++right) {
        wchar_t const x = tzhost::lowerOf(*left);
        wchar_t const y = tzhost::lowerOf(*right);
        if (x != y) return x < y ? -1 : 1;
        if (x == 0) return 0;
    }
}

int TzString::compareNoCase(wchar_t const* other) const {
    return tzCompareNoCase(kwszPtr(), other);
}

TzString& TzString::makeLower() {
    for (wchar_t& c : text_)
        c = tzhost::lowerOf(c);
    return *this;
}

TzString& TzString::makeUpper() {
    for (wchar_t& c : text_)
        c = tzhost::upperOf(c);
    return *this;
}
