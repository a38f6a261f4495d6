#include "module/markup/read_markup/font_code.h"

#include "module/markup/shared/wrapping.h"

namespace {

constexpr int kMostDigits = 16;

int readDigits(wchar_t const*& cursor) {
    int value = 0;
    for (int i = 0; i < kMostDigits && isDigit(*cursor); ++i, ++cursor)
        value = withDigit(value, *cursor - L'0');
    return value;
}

// Consumes one character, whatever it is; true only for a "1".
bool readFlag(wchar_t const*& cursor) {
    if (*cursor == 0) return false;
    return *cursor++ == L'1';
}

// The name, up to the "|" or ";" that ends it.
CStdStrW readName(wchar_t const*& cursor) {
    CStdStrW name;
    for (; *cursor != 0 && *cursor != L';' && *cursor != L'|'; ++cursor) {
        if (*cursor == L'\\') name += L'\\';
        name += *cursor;
    }
    return name;
}

}  // namespace

FontCode readFileCode(wchar_t const*& cursor) {
    FontCode code;
    code.name = readName(cursor);
    while (*cursor != 0 && *cursor != L';') {
        if (*cursor++ != L'c') continue;
        code.hasCharset = true;
        code.charset = static_cast<Charset>(readDigits(cursor));
    }
    if (*cursor == L';') ++cursor;
    return code;
}

FontCode readFaceCode(wchar_t const*& cursor, bool& hasFields) {
    FontCode code;
    code.name = readName(cursor);
    hasFields = *cursor == L'|';
    while (hasFields && *cursor != 0 && *cursor != L';') {
        switch (*cursor++) {
        case L'b': code.bold = readFlag(cursor); break;
        case L'i': code.italic = readFlag(cursor); break;
        case L'c': code.charset = static_cast<Charset>(readDigits(cursor)); break;
        case L'p': code.pitch = readDigits(cursor); break;
        default: break;
        }
    }
    return code;
}
