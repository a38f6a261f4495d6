// What the codes of the markup do, but for fonts, paragraphs and stacks.

#include "module/markup/read_markup/markup_numbers.h"
#include "module/markup/shared/rtf_escapes.h"
#include "module/markup/shared/rtf_units.h"
#include "module/markup/write_rtf/mtext_to_rtf.h"
#include "tz/mte/scale_correction.h"
#include "tz/pal/windows_calls.h"
#include "tz/text/code_page.h"

namespace {

constexpr int kRgbMask = 0xFFFFFF;
constexpr std::size_t kMultibyteLength = 8;  // `\M+nXXXX`

}  // namespace

void CMTextToRichTextContext::onAlignment(wchar_t const*& cursor) {
    int const alignment = GetNumber(cursor);
    if (alignment >= kAlignBottom && alignment <= kAlignTop)
        m_eBaseAlignment = static_cast<VerticalAlignment>(alignment);
}

void CMTextToRichTextContext::onColorIndex(wchar_t const*& cursor) {
    AppendToken(L"cf", AddColor(GetNumber(cursor), false));
}

void CMTextToRichTextContext::onColor(wchar_t const*& cursor) {
    AppendToken(L"cf", AddColor(static_cast<unsigned int>(GetNumber(cursor) & kRgbMask), false));
}

// At the outermost level the size is written at once, in a group with the next character.
void CMTextToRichTextContext::onHeight(wchar_t const*& cursor) {
    signed char isRelative = 0;
    double const number = GetRealNumber(cursor, &isRelative, true);
    lastFactor_ = isRelative ? number : 1.0;
    double const size = isRelative ? EffectiveSize() * number : number;
    int const halfPoints = MulDiv(m_pFontScale->ScaleUnitsToTwips(size), 1, kTwipsPerHalfPoint);
    updateSizes(halfPoints);
    m_nPendingFontSize = halfPoints;
    SetEffectiveSize(size);
    if (m_nState == 0) flushSize();
}

void CMTextToRichTextContext::onUnderline(wchar_t const*&) {
    AppendToken(L"ul");
}

void CMTextToRichTextContext::onUnderlineOff(wchar_t const*&) {
    AppendToken(L"ul0");
}

void CMTextToRichTextContext::onOverline(wchar_t const*&) {
    AppendToken(L"strike");
}

void CMTextToRichTextContext::onOverlineOff(wchar_t const*&) {
    AppendToken(L"strike0");
}

void CMTextToRichTextContext::onParagraph(wchar_t const*&) {
    AppendToken(L"par");
}

bool CMTextToRichTextContext::takesValue(bool isDefault, unsigned int late, unsigned int ignored) {
    if (IsIncident(late) || !isDefault) {
        ReportIncident(ignored);
        return false;
    }
    if (chars_ > 0) ReportIncident(late);
    return true;
}

void CMTextToRichTextContext::onTracking(wchar_t const*& cursor) {
    double const value = GetRealNumber(cursor, nullptr, true);
    if (takesValue(m_dTracking == 1.0, kTrackingLate, kTrackingIgnored)) SetTracking(value);
}

void CMTextToRichTextContext::onCharWidth(wchar_t const*& cursor) {
    double const value = GetRealNumber(cursor, nullptr, true);
    if (takesValue(m_dCharWidth == 1.0, kCharWidthLate, kCharWidthIgnored)) SetCharWidth(value);
}

void CMTextToRichTextContext::onOblique(wchar_t const*& cursor) {
    double const value = GetRealNumber(cursor, nullptr, true);
    if (takesValue(m_dOblique == 0.0, kObliqueLate, kObliqueIgnored)) SetOblique(value);
}

void CMTextToRichTextContext::onUnicode(wchar_t const*& cursor) {
    flushSize();
    Append(ConvertMTextUSequence(cursor).c_str());
}

// Kept as text after one more backslash, by which the reader of the other direction knows it.
void CMTextToRichTextContext::onMultibyte(wchar_t const*& cursor) {
    wchar_t const* const code = cursor - 2;
    if (!getMIF(code)) return onUnknown(--cursor);
    flushSize();
    Append(L'\\');
    Append(std::wstring_view(code, kMultibyteLength));
    cursor = code + kMultibyteLength;
}

void CMTextToRichTextContext::onEscape(wchar_t const*& cursor) {
    flushSize();
    Append(std::wstring_view(cursor - 2, 2));
}

// The cursor stands on the code's character, which may be the end of the text.
void CMTextToRichTextContext::onUnknown(wchar_t const*& cursor) {
    flushSize();
    Append(L"\\\\");
    if (*cursor != 0) Append(Handle8Bits(*cursor++).c_str());
    ReportIncident(kUnknownCode);
}
