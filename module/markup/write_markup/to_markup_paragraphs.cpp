// Paragraph settings of rich text.

#include "module/markup/shared/number_text.h"
#include "module/markup/shared/wrapping.h"
#include "module/markup/write_markup/rtf_to_mtext.h"
#include "tz/mte/globals.h"
#include "tz/mte/scale_correction.h"

namespace {

// Begins the code before its first setting, and separates each later one from the one before.
void appendSetting(CStdStrW& code, wchar_t key) {
    code += code.empty() ? L"\\p" : L",";
    code += key;
}

}  // namespace

// The look-ahead does not consume the words of the settings: the reader of words meets them next,
// does not know them and drops them.
void CRichTextToMTextContext::OnDefaultParagraph(wchar_t const*& cursor, int) {
    appendParagraphSettings(paragraphs_.settingsFrom(cursor));
}

void CRichTextToMTextContext::appendParagraphSettings(ParagraphSettings const& settings) {
    CStdStrW code;
    if (settings.firstIndent != m_paragraph.firstIndent) {
        appendSetting(code, L'i');
        appendReal(code, marginUnits(settings.firstIndent));
    }
    if (settings.leftIndent != m_paragraph.leftIndent) {
        appendSetting(code, L'l');
        appendReal(code, marginUnits(settings.leftIndent));
    }
    if (!settings.hasTabsOf(m_paragraph)) {
        appendSetting(code, L't');
        if (settings.tabCount == 0) code += L'z';
        for (int i = 0; i < settings.tabCount; ++i) {
            if (i > 0) code += L',';
            appendReal(code, marginUnits(settings.tabs[static_cast<std::size_t>(i)]));
        }
    }
    if (code.empty()) return;
    code += L';';
    Append(std::wstring_view(code));
    m_paragraph = settings;
}

// The sign is taken off before the scale, which remembers no negative lengths.
double CRichTextToMTextContext::marginUnits(int twips) const {
    double const units =
        m_pMarginScale->ScaleTwipsToUnits(twips < 0 ? wrappingNegative(twips) : twips) /
        gdTweakFactor;
    return twips < 0 ? -units : units;
}
