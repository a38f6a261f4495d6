#include "module/edit/field_backslashes.h"

#include <utility>

#include "tz/db/field.h"

void convertBackslashesInFields(CStdStrW& text, signed char flag) {
    wchar_t const* const one = L"\\";
    wchar_t const* const two = L"\\\\";
    CStdStrW converted;
    int copied = 0;
    int first = 0;
    int end = 0;
    // The text is put together from its pieces: exchanging each span in place would move all that
    // follows once for each field.
    while (tzdbFindField(text.c_str(), copied, first, end)) {
        CStdStrW field = text.Mid(first, end - first);
        field.Replace(flag ? one : two, flag ? two : one);
        converted += text.Mid(copied, first - copied);
        converted += field;
        copied = end;
    }
    if (copied == 0) return;
    converted += text.Mid(copied);
    text = std::move(converted);
}
