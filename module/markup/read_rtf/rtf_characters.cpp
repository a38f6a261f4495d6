#include "module/markup/read_rtf/rtf_characters.h"

#include "module/markup/shared/wrapping.h"

namespace {

CStdStrW widened(std::string const& bytes) {
    CStdStrW text;
    for (char const c : bytes)
        text += static_cast<wchar_t>(static_cast<unsigned char>(c));
    return text;
}

bool isLeadByte(wchar_t c, code_page_id page) {
    return c > 0 && c <= 0xFF && TzCharacterCheck::IsLeadByte(page, static_cast<unsigned char>(c));
}

// A trail byte and its lead byte as one value.
int withTrailByte(int lead, wchar_t trail) {
    return (lead << 8) + (trail & 0xFF);
}

void takeByte(std::string& bytes, wchar_t const*& cursor) {
    if (*cursor != 0) bytes += static_cast<char>(*cursor++);
}

}  // namespace

void skipRtfWhiteSpace(wchar_t const*& cursor) {
    while (isRtfWhiteSpace(*cursor))
        ++cursor;
}

int GetHexDigit(wchar_t const*& cursor) {
    if (*cursor == 0) return 0;
    int const value = hexDigitValue(*cursor++);
    return value < 0 ? 0 : value;
}

int locGetHexChar(wchar_t const*& cursor) {
    skipRtfWhiteSpace(cursor);
    int const high = GetHexDigit(cursor);
    skipRtfWhiteSpace(cursor);
    return high * 16 + GetHexDigit(cursor);
}

int WideCharacter(wchar_t const*& cursor, code_page_id page) {
    int const lead = locGetHexChar(cursor);
    skipRtfWhiteSpace(cursor);
    if (*cursor == 0 || *cursor == L'{' || *cursor == L'}' || !isLeadByte(lead, page)) return lead;
    if (*cursor != L'\\') return withTrailByte(lead, *cursor++);
    if (cursor[1] == L'\'') {
        cursor += 2;
        return withTrailByte(lead, locGetHexChar(cursor));
    }
    if (cursor[1] != L'\\') return lead;
    cursor += 2;
    return withTrailByte(lead, L'\\');
}

CStdStrW WideCharacterString(wchar_t const*& cursor, code_page_id_ex page) {
    std::string const bytes = DoubleByteString(WideCharacter(cursor, page));
    CStdStrW text;
    if (UnicodeConvert::multibyteToWide(page, bytes, text) && text.size() == 1) return text;
    return widened(bytes);
}

std::string DoubleByteString(int value) {
    std::string bytes;
    if (((value >> 8) & 0xFF) != 0) bytes += static_cast<char>((value >> 8) & 0xFF);
    bytes += static_cast<char>(value & 0xFF);
    return bytes;
}

std::string GetCharacterMBCS(wchar_t const*& cursor, code_page_id page) {
    std::string bytes;
    skipRtfWhiteSpace(cursor);
    if (*cursor == L'\\') {
        ++cursor;
        skipRtfWhiteSpace(cursor);
        if (*cursor == L'\'') {
            ++cursor;
            return DoubleByteString(WideCharacter(cursor, page));
        }
        if (*cursor != L'\\') return bytes;
        takeByte(bytes, cursor);
        skipRtfWhiteSpace(cursor);
        takeByte(bytes, cursor);
        return bytes;
    }
    bool const isLead = isLeadByte(*cursor, page);
    takeByte(bytes, cursor);
    if (!isLead) return bytes;
    skipRtfWhiteSpace(cursor);
    takeByte(bytes, cursor);
    return bytes;
}

CStdStrW GetCharacter(wchar_t const*& cursor, code_page_id_ex page) {
    std::string const bytes = GetCharacterMBCS(cursor, page);
    CStdStrW text;
    return UnicodeConvert::multibyteToWide(page, bytes, text) ? text : widened(bytes);
}
