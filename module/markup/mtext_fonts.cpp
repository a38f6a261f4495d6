// Fonts of the markup: by file and by face.

#include "module/markup/mtext_to_rtf.h"
#include "module/markup/wrapping.h"
#include "tz/mte/font_map_database.h"
#include "tz/text/font_info.h"

// What a font code says. A code that the text cuts off says what there was of it.
struct CMTextToRichTextContext::FontFields {
    CStdStrW name;  // with every backslash doubled
    bool hasFields = false;
    bool bold = false;
    bool italic = false;
    bool hasCharset = false;
    Charset charset = kDefaultCharset;
    int pitch = 0;
};

namespace {

constexpr int kMostDigits = 16;

int readDigits(wchar_t const*& cursor) {
    int value = 0;
    for (int i = 0; i < kMostDigits && isDigit(*cursor); ++i, ++cursor)
        value = withDigit(value, *cursor - L'0');
    return value;
}

// One character, whatever it is; true only when that is a "1".
bool readFlag(wchar_t const*& cursor) {
    if (*cursor == 0) return false;
    return *cursor++ == L'1';
}

// The name, up to the "|" or ";" behind it.
CStdStrW readName(wchar_t const*& cursor) {
    CStdStrW name;
    for (; *cursor != 0 && *cursor != L';' && *cursor != L'|'; ++cursor) {
        if (*cursor == L'\\') name += L'\\';
        name += *cursor;
    }
    return name;
}

}  // namespace

// Without fields the ";" is consumed, and the one field is the set.
void CMTextToRichTextContext::onFontFile(wchar_t const*& cursor) {
    wchar_t const* const start = cursor - 1;
    FontFields fields;
    fields.name = readName(cursor);
    while (*cursor != 0 && *cursor != L';') {
        if (*cursor++ != L'c') continue;
        fields.hasCharset = true;
        fields.charset = static_cast<Charset>(readDigits(cursor));
    }
    if (*cursor == L';') ++cursor;
    std::wstring_view const code(start, static_cast<std::size_t>(cursor - start));
    if (auto const known = fontCodes_.find(code); known != fontCodes_.end())
        return takeFont(known->second);
    ResolvedFont const font = resolveFile(fields);
    takeFont(font);
    // A file that no face was left for asks for one again each time.
    bool const isLent = (font.incidents & kFontByProxy) != 0;
    if (!isLent || !m_pFontMap->ProxiesExhausted()) fontCodes_.emplace(code, font);
}

// Without fields the ";" is not consumed and comes out as text, unlike that of a font file.
void CMTextToRichTextContext::onFontFace(wchar_t const*& cursor) {
    wchar_t const* const start = cursor - 1;
    FontFields fields;
    fields.name = readName(cursor);
    bool const hasFields = *cursor == L'|';
    while (hasFields && *cursor != 0 && *cursor != L';') {
        switch (*cursor++) {
        case L'b': fields.bold = readFlag(cursor); break;
        case L'i': fields.italic = readFlag(cursor); break;
        case L'c': fields.charset = static_cast<Charset>(readDigits(cursor)); break;
        case L'p': fields.pitch = readDigits(cursor); break;
        default: break;
        }
    }
    std::wstring_view const code(start, static_cast<std::size_t>(cursor - start));
    if (hasFields && *cursor == L';') ++cursor;
    auto known = fontCodes_.find(code);
    if (known == fontCodes_.end()) known = fontCodes_.emplace(code, resolveFace(fields)).first;
    takeFont(known->second);
}

CMTextToRichTextContext::ResolvedFont
CMTextToRichTextContext::resolveFile(FontFields const& fields) {
    ResolvedFont font;
    auto type = CMTextFontMapDatabase::MapTypeSystem;
    CStdStrW const face = m_pFontMap->MapFileToFont(type, fields.name, font.bold, font.italic,
                                                    font.charset, font.pitchAndFamily);
    if (type == CMTextFontMapDatabase::MapTypeProxy) font.incidents = kFontByProxy;
    if (fields.hasCharset) font.charset = fields.charset;
    font.slot = AddFont(face.c_str(), font.charset, font.pitchAndFamily);
    font.font = face;
    return font;
}

// The document's font has the set that the machine's face has, the state the one that was written.
CMTextToRichTextContext::ResolvedFont
CMTextToRichTextContext::resolveFace(FontFields const& fields) {
    ResolvedFont font;
    font.bold = fields.bold;
    font.italic = fields.italic;
    CStdStrW const face = tzFontInfo().TypefaceEnglishToNative(fields.name);
    auto type = CMTextFontMapDatabase::MapTypeSystem;
    CStdStrW const file = m_pFontMap->MapFontToFile(type, face, fields.bold, fields.italic,
                                                    fields.charset, fields.pitch);
    if (file.empty()) font.incidents = kFaceWithoutFile;
    CFontInfoItem item;
    bool const isKnown = tzFontInfo().FontInfoFromTypeFaceName(face, item);
    font.slot = AddFont(face.c_str(), isKnown ? item.charset : fields.charset, fields.pitch);
    font.font = fields.name;
    font.pitchAndFamily = fields.pitch;
    font.charset = fields.charset;
    return font;
}

void CMTextToRichTextContext::takeFont(ResolvedFont const& font) {
    ReportIncident(font.incidents);
    AppendToken(L"f", font.slot);
    AppendToken(L"b", font.bold ? 1 : 0);
    AppendToken(L"i", font.italic ? 1 : 0);
    SetFont(font.font);
    SetPitchAndFamily(font.pitchAndFamily);
    SetCharSet(font.charset);
}
