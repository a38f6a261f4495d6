// Set-up, and the text around what was read.

#include "module/markup/write_markup/rtf_to_mtext.h"

#include <cwchar>

#include "module/markup/shared/number_text.h"
#include "tz/mte/font_map_database.h"

namespace {

void appendDefault(CStdStrW& text, wchar_t const* code, double value, double silent) {
    if (value == silent) return;
    text += code;
    appendReal(text, value);
    text += L';';
}

bool endsInParagraph(CStdStrW const& text) {
    return text.size() >= 2 && text[text.size() - 2] == L'\\' && text.back() == L'P';
}

}  // namespace

CRichTextToMTextContext::CRichTextToMTextContext(CMTextFontMapDatabase* fontMap,
                                                 CScaleCorrection* fontScale,
                                                 CScaleCorrection* marginScale)
    : CFontState(fontMap), m_nCodePage(Locale::getSystemCodePageIdEx()), m_pFontMap(fontMap),
      m_pFontScale(fontScale), m_pMarginScale(marginScale) {}

void CRichTextToMTextContext::SetInitialFontName(
    wchar_t const* name, bool bold, bool italic, Charset charset, int pitchAndFamily) {
    InitializeFontName(names().intern(name), bold, italic, charset, pitchAndFamily);
}

void CRichTextToMTextContext::SetInitialFontFileName(wchar_t const* file) {
    auto type = CMTextFontMapDatabase::MapTypeSystem;
    bool bold = false;
    bool italic = false;
    Charset charset = kAnsiCharset;
    int pitch = 0;
    CStdStrW const face = m_pFontMap->MapFileToFont(type, file, bold, italic, charset, pitch);
    SetInitialFontName(face.c_str(), bold, italic, charset, pitch);
}

void CRichTextToMTextContext::SetInitialFontSize(double size, int /*twips*/) {
    InitializeFontSize(size);
}

void CRichTextToMTextContext::SetInitialColor(unsigned int rgb) {
    InitializeColor(GetTzadIndex(rgb), rgb);
}

CStdStrW CRichTextToMTextContext::Parse(wchar_t const* text) {
    run(text, std::wcslen(text));
    return finished(Close());
}

CStdStrW CRichTextToMTextContext::parseOnce(std::wstring const& text) {
    run(text.c_str(), text.size());
    return finished(std::move(Close()));
}

// What was learned of an earlier document does not hold for this one, so it is dropped.
void CRichTextToMTextContext::run(wchar_t const* text, std::size_t length) {
    if (!isOpen()) Grow();
    forgetFaceCodes();
    paragraphs_ = {};
    m_bStackSeen = false;
    // More than needed: untouched pages cost nothing, while growing would copy the text.
    reserve(length + length / 2);
    Convert(text);
}

CStdStrW CRichTextToMTextContext::finished(CStdStrW markup) {
    if (CStdStrW const defaults = InitialDefaults(); !defaults.empty()) markup.insert(0, defaults);
    // Compares the two last characters only, so that a "P" after an escaped backslash of the text
    // is taken for a paragraph mark too.
    while ((m_nOptions & kKeepTrailingParagraphs) == 0 && endsInParagraph(markup))
        markup.resize(markup.size() - 2);
    markup += EmitTerminatingStateInMText();
    return markup;
}

// Stands before all text, so that these hold for the whole of it.
CStdStrW CRichTextToMTextContext::InitialDefaults() const {
    CStdStrW text;
    appendDefault(text, L"\\T", m_dTracking, 1.0);
    appendDefault(text, L"\\W", m_dCharWidth, 1.0);
    appendDefault(text, L"\\Q", m_dOblique, 0.0);
    if (VerticalAlignment const alignment = GetBaseAlignment(0);
        alignment != kAlignBottom && m_bStackSeen) {
        text += L"\\A";
        appendDecimal(text, alignment);
        text += L';';
    }
    return text;
}
