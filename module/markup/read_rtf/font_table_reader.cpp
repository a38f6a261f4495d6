#include "module/markup/read_rtf/font_table_reader.h"

#include "module/markup/read_rtf/rtf_characters.h"
#include "module/markup/read_rtf/rtf_tokens.h"
#include "module/markup/shared/font_families.h"
#include "module/markup/shared/rtf_font_table.h"

namespace {

struct FontEntry {
    CStdStrW name;
    int id = -1;
    Charset charset = kDefaultCharset;
    int pitchAndFamily = 0;
    bool hasName = false;  // `\fname` was seen: the name is complete

    [[nodiscard]] code_page_id_ex page() const { return TzCodePage::CharSetToCodePageId(charset); }
};

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
            skipGroupRest(++cursor);
            return name;
        }
        if (*cursor == L';') {
            ++cursor;
            return name;
        }
        name += GetCharacter(cursor, page);
    }
}

// True when the group gave the name; any other group leaves the name alone. The closing brace of
// the group is left to the reader of the entry.
bool readSubEntry(wchar_t const*& cursor, FontEntry& entry) {
    bool isName = false;
    for (;;) {
        RtfStep const step = nextStep(cursor);
        switch (step.kind) {
        case RtfStep::end: return false;
        case RtfStep::close: cursor = step.start; return isName;
        case RtfStep::open: skipGroupRest(cursor); break;
        case RtfStep::word:
            if (step.name == L"fname") isName = true;
            break;
        case RtfStep::symbol:
            if (*cursor == L'*') {
                ++cursor;
            } else if (isName) {
                cursor = step.start;
                entry.name += GetCharacter(cursor, entry.page());
            }
            break;
        case RtfStep::character:
            if (isName && !isRtfWhiteSpace(*step.start)) {
                cursor = step.start;
                entry.name = readName(cursor, entry.page());
            }
            break;
        }
    }
}

void takeWord(FontEntry& entry, RtfStep const& step) {
    if (step.name == L"f") entry.id = step.value;
    if (step.name == L"fcharset") entry.charset = static_cast<Charset>(step.value);
    entry.pitchAndFamily |= step.name == L"fprq" ? step.value : familyOf(step.name);
}

void takeCharacter(FontEntry& entry, wchar_t const*& cursor, wchar_t const* start) {
    if (isRtfWhiteSpace(*start)) return;
    if (entry.name.empty()) {
        cursor = start;
        entry.name = readName(cursor, entry.page());
    } else if (!entry.hasName && *start != L';') {
        entry.name += *start;
    }
}

// An entry that the text cuts off, or that has no number, is dropped.
void readEntry(wchar_t const*& cursor, CRichTextFontTable& fonts) {
    FontEntry entry;
    for (;;) {
        RtfStep const step = nextStep(cursor);
        switch (step.kind) {
        case RtfStep::end: return;
        case RtfStep::close:
            if (entry.id != -1)
                fonts.AddFont(static_cast<long long>(entry.id), entry.name.c_str(), entry.charset,
                              entry.pitchAndFamily);
            return;
        case RtfStep::open:
            if (readSubEntry(cursor, entry)) entry.hasName = true;
            if (*cursor == L'}') ++cursor;
            break;
        case RtfStep::word: takeWord(entry, step); break;
        case RtfStep::symbol:
            cursor = step.start;
            entry.name += GetCharacter(cursor, entry.page());
            break;
        case RtfStep::character: takeCharacter(entry, cursor, step.start); break;
        }
    }
}

}  // namespace

void readFontTable(wchar_t const*& cursor, CRichTextFontTable& fonts) {
    for (;;) {
        RtfStep const step = nextStep(cursor);
        if (step.kind == RtfStep::end || step.kind == RtfStep::close) return;
        if (step.kind == RtfStep::open) readEntry(cursor, fonts);
    }
}
