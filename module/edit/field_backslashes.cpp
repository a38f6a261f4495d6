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
    // follows once for each field. The host is given the rest alone, since it may look at all that
    // stands before a start.
    while (tzdbFindField(text.c_str() + copied, 0, first, end)) {
        CStdStrW field = text.Mid(copied + first, end - first);
        field.Replace(flag ? one : two, flag ? two : one);
        converted += text.Mid(copied, first);
        converted += field;
        copied += end;
    }
    if (copied == 0) return;
    converted += text.Mid(copied);
    text = std::move(converted);
}
