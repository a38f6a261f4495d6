// Paragraph settings of the markup.

#include <cmath>

#include "module/markup/read_markup/markup_numbers.h"
#include "module/markup/shared/wrapping.h"
#include "module/markup/write_rtf/mtext_to_rtf.h"
#include "tz/mte/globals.h"
#include "tz/mte/scale_correction.h"

namespace {

double readReal(wchar_t const*& cursor) {
    return GetRealNumber(cursor, nullptr, false);
}

void skipComma(wchar_t const*& cursor) {
    if (*cursor == L',') ++cursor;
}

}  // namespace

// Stops at the first character that is no setting; what stands there is text unless it is a ";".
void CMTextToRichTextContext::onParagraphSettings(wchar_t const*& cursor) {
    ParagraphSettings settings = top().paragraph;
    settings.isSet = true;
    for (bool isSetting = true; isSetting;) {
        switch (*cursor) {
        case L'i':
            settings.firstIndent = signedMarginTwips(readReal(++cursor));
            skipComma(cursor);
            break;
        case L'l':
            settings.leftIndent = signedMarginTwips(readReal(++cursor));
            skipComma(cursor);
            break;
        case L't': readTabs(++cursor, settings); break;
        default: isSetting = false; break;
        }
    }
    UpdateParagraphSettings(settings);
    if (*cursor == L';') ++cursor;
}

void CMTextToRichTextContext::readTabs(wchar_t const*& cursor, ParagraphSettings& settings) {
    settings.tabCount = 0;
    if (*cursor == L'z') {
        ++cursor;
        return;
    }
    settings.AddTab(marginTwips(readReal(cursor)));
    while (*cursor == L',')
        settings.AddTab(marginTwips(readReal(++cursor)));
}

int CMTextToRichTextContext::marginTwips(double value) {
    return m_pMarginScale->ScaleUnitsToTwips(value * gdTweakFactor);
}

int CMTextToRichTextContext::signedMarginTwips(double value) {
    int const twips = marginTwips(std::fabs(value));
    return value < 0 ? wrappingNegative(twips) : twips;
}

void CMTextToRichTextContext::UpdateParagraphSettings(ParagraphSettings const& settings) {
    ParagraphSettings& old = top().paragraph;
    bool const isReset = !settings.hasTabsOf(old);
    if (isReset) AppendToken(L"pard");
    if (isReset || settings.firstIndent != old.firstIndent)
        AppendToken(L"fi", settings.firstIndent);
    if (isReset || settings.leftIndent != old.leftIndent) AppendToken(L"li", settings.leftIndent);
    for (int i = 0; isReset && i < settings.tabCount; ++i)
        AppendToken(L"tx", settings.tabs[static_cast<std::size_t>(i)]);
    old = settings;
}
