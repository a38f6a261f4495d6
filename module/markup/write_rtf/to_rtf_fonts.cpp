// Fonts of the markup: by file and by face.

#include "module/markup/read_markup/font_code.h"
#include "module/markup/write_rtf/mtext_to_rtf.h"
#include "tz/mte/font_map_database.h"
#include "tz/text/font_info.h"

namespace {

std::wstring_view between(wchar_t const* start, wchar_t const* end) {
    return {start, static_cast<std::size_t>(end - start)};
}

}  // namespace

void CMTextToRichTextContext::onFontFile(wchar_t const*& cursor) {
    wchar_t const* const start = cursor - 1;
    FontCode const code = readFileCode(cursor);
    std::wstring_view const text = between(start, cursor);
    if (auto const known = fontCodes_.find(text); known != fontCodes_.end())
        return takeFont(known->second);
    ResolvedFont const font = resolveFile(code);
    takeFont(font);
    if (font.incidents != 0)
        fontCodes_.clear();
    else if (!CMTextFontMapDatabase::IsBigfontFilespec(code.name))
        fontCodes_.emplace(text, font);
}

void CMTextToRichTextContext::onFontFace(wchar_t const*& cursor) {
    wchar_t const* const start = cursor - 1;
    bool hasFields = false;
    FontCode const code = readFaceCode(cursor, hasFields);
    std::wstring_view const text = between(start, cursor);
    if (hasFields && *cursor == L';') ++cursor;
    auto known = fontCodes_.find(text);
    if (known == fontCodes_.end()) known = fontCodes_.emplace(text, resolveFace(code)).first;
    takeFont(known->second);
}

CMTextToRichTextContext::ResolvedFont CMTextToRichTextContext::resolveFile(FontCode const& code) {
    ResolvedFont font;
    auto type = CMTextFontMapDatabase::MapTypeSystem;
    CStdStrW const face = m_pFontMap->MapFileToFont(type, code.name, font.bold, font.italic,
                                                    font.charset, font.pitchAndFamily);
    if (type == CMTextFontMapDatabase::MapTypeProxy) font.incidents = kFontByProxy;
    if (code.hasCharset) font.charset = code.charset;
    font.slot = AddFont(face.c_str(), font.charset, font.pitchAndFamily);
    font.font = face;
    return font;
}

// The RTF font gets the charset of the installed face; the state keeps the charset written in the
// code.
CMTextToRichTextContext::ResolvedFont CMTextToRichTextContext::resolveFace(FontCode const& code) {
    ResolvedFont font;
    font.bold = code.bold;
    font.italic = code.italic;
    CStdStrW const face = tzFontInfo().TypefaceEnglishToNative(code.name);
    auto type = CMTextFontMapDatabase::MapTypeSystem;
    CStdStrW const file =
        m_pFontMap->MapFontToFile(type, face, code.bold, code.italic, code.charset, code.pitch);
    if (file.empty()) font.incidents = kFaceWithoutFile;
    CFontInfoItem item;
    bool const isKnown = tzFontInfo().FontInfoFromTypeFaceName(face, item);
    font.slot = AddFont(face.c_str(), isKnown ? item.charset : code.charset, code.pitch);
    font.font = code.name;
    font.pitchAndFamily = code.pitch;
    font.charset = code.charset;
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
