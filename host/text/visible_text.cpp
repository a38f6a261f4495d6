#include "host/text/visible_text.h"

#include "host/text/utf8.h"

namespace tzhost {

namespace {

constexpr wchar_t kDelete = 0x7F;
constexpr wchar_t kLastControl = 0x9F;  // the controls after U+007F end here

bool isControl(wchar_t c) {
    return (c >= 0 && c < L' ') || (c >= kDelete && c <= kLastControl);
}

bool isShownAsCode(wchar_t c, LineFeeds lineFeeds) {
    if (c == L'\n') return lineFeeds == LineFeeds::shown;
    return c != L'\t' && isControl(c);
}

void appendCode(std::wstring& text, wchar_t c) {
    constexpr wchar_t kDigits[] = L"0123456789ABCDEF";
    text += L"\\U+00";
    text += kDigits[c >> 4];
    text += kDigits[c & 0xF];
}

}  // namespace

std::wstring visible(std::wstring_view text, LineFeeds lineFeeds) {
    std::wstring shown;
    shown.reserve(text.size());
    for (wchar_t const c : text) {
        if (isShownAsCode(c, lineFeeds)) {
            appendCode(shown, c);
        } else {
            shown += c;
        }
    }
    return shown;
}

std::string visible(std::string_view text, LineFeeds lineFeeds) {
    return toUtf8(visible(fromUtf8(text), lineFeeds));
}

}  // namespace tzhost
