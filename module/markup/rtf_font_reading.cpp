// The font table of a document.

#include "module/markup/rtf_reading.h"
#include "module/markup/rtf_to_mtext.h"
#include "module/markup/rtf_tokens.h"

struct CRichTextToMTextContext::FontEntry {
    CStdStrW name;
    int id = -1;
    Charset charset = kDefaultCharset;
    int pitchAndFamily = 0;
    bool hasName = false;  // `\fname` was seen: the name is complete

    [[nodiscard]] code_page_id_ex page() const { return TzCodePage::CharSetToCodePageId(charset); }
};

namespace {

struct FamilyRow {
    std::wstring_view word;
    int family;
};
constexpr FamilyRow kFamilies[] = {
    {L"fnil",    0x00},
    {L"froman",  0x10},
    {L"fswiss",  0x20},
    {L"fmodern", 0x30},
    {L"fscript", 0x40},
    {L"fdecor",  0x50},
};

int familyOf(std::wstring_view word) {
    for (FamilyRow const& row : kFamilies) {
        if (row.word == word) return row.family;
    }
    return 0;
}

// Whether a character of a name needs no decoding, in no page.
constexpr bool isPlain(wchar_t c) {
    return c >= L' ' && c < 0x7F && c != L'\\' && c != L';' && c != L'{';
}

// A name up to its ";", which is consumed, or up to a group, which is skipped. A brace that closes
// does not end it.
CStdStrW readName(wchar_t const*& cursor, code_page_id_ex page) {
    CStdStrW name;
    for (;;) {
        while (isPlain(*cursor))
            name += *cursor++;
        skipRtfWhiteSpace(cursor);
        if (*cursor == 0) return name;
        if (*cursor == L'{') {
            skipGroup(cursor);
            return name;
        }
        if (*cursor == L';') {
            ++cursor;
            return name;
        }
        name += GetCharacter(cursor, page);
    }
}

}  // namespace

// The table ends with its own brace, which it consumes: the reader of groups is one group deeper
// behind it than the document is.
void CRichTextToMTextContext::OnFontTable(wchar_t const*& cursor, int) {
    while (*cursor != 0) {
        wchar_t const c = *cursor++;
        if (c == L'}') return;
        if (c == L'{') OnFontTableEntry(cursor);
    }
}

// An entry that the text cuts off, or that has no number, is dropped.
void CRichTextToMTextContext::OnFontTableEntry(wchar_t const*& cursor) {
    FontEntry entry;
    while (*cursor != 0) {
        wchar_t const* const start = cursor++;
        if (*start == L'}') {
            if (entry.id != -1)
                AddFont(static_cast<long long>(entry.id), entry.name.c_str(), entry.charset,
                        entry.pitchAndFamily);
            return;
        }
        if (*start == L'{') {
            if (OnFontTableSubEntry(cursor, entry)) entry.hasName = true;
            if (*cursor == L'}') ++cursor;
        } else if (*start == L'\\') {
            int value = 0;
            std::wstring_view const word = GetToken(cursor, value);
            if (word == L"f") entry.id = value;
            if (word == L"fcharset") entry.charset = static_cast<Charset>(value);
            entry.pitchAndFamily |= word == L"fprq" ? value : familyOf(word);
            if (word.empty()) {
                cursor = start;
                entry.name += GetCharacter(cursor, entry.page());
            }
        } else if (!isRtfWhiteSpace(*start)) {
            if (entry.name.empty()) {
                cursor = start;
                entry.name = readName(cursor, entry.page());
            } else if (!entry.hasName && *start != L';') {
                entry.name += *start;
            }
        }
    }
}

// True when the group gave the name. Any other group leaves it alone.
bool CRichTextToMTextContext::OnFontTableSubEntry(wchar_t const*& cursor, FontEntry& entry) {
    bool isName = false;
    while (*cursor != 0) {
        wchar_t const* const start = cursor;
        if (*start == L'}') return isName;
        if (*start == L'{') {
            skipGroup(cursor);
            continue;
        }
        ++cursor;
        if (*start == L'\\') {
            int value = 0;
            std::wstring_view const word = GetToken(cursor, value);
            if (word == L"fname") isName = true;
            if (!word.empty()) continue;
            if (*cursor == L'*') {
                ++cursor;
            } else if (isName) {
                cursor = start;
                entry.name += GetCharacter(cursor, entry.page());
            }
        } else if (isName && !isRtfWhiteSpace(*start)) {
            cursor = start;
            entry.name = readName(cursor, entry.page());
        }
    }
    return false;
}
