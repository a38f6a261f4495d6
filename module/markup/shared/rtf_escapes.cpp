#include "module/markup/shared/rtf_escapes.h"

#include "tz/text/text_editor.h"

namespace {

constexpr wchar_t kHexDigits[] = L"0123456789abcdef";

void appendEscape(CStdStrW& text, unsigned int byte) {
    text += L'\\';
    text += L'\'';
    text += kHexDigits[(byte >> 4) & 0xF];
    text += kHexDigits[byte & 0xF];
}

}  // namespace

CStdStrW Expand8Bits(wchar_t c) {
    CStdStrW text;
    appendEscape(text, static_cast<unsigned int>(c));
    return text;
}

CStdStrW Handle8Bits(wchar_t c) {
    return (c & 0xFF80) != 0 ? Expand8Bits(c) : CStdStrW(std::wstring(1, c));
}

CStdStrW ExpandDoubleByte(wchar_t const*& cursor) {
    CStdStrW text(L"{\\dbch ");
    if (*cursor != 0) text += Handle8Bits(*cursor++);
    if (*cursor != 0) text += Expand8Bits(*cursor++);
    text += L'}';
    return text;
}

CStdStrW HandleEscaped8Bits(CStdStrW s, code_page_id page) {
    CStdStrW text;
    for (char const c : TextEditor::UnicodeToMultiByte(s, page)) {
        auto const byte = static_cast<unsigned char>(c);
        if (byte < 0x80)
            text += static_cast<wchar_t>(byte);
        else
            appendEscape(text, byte);
    }
    return text;
}
