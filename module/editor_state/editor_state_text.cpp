// The text of a session in its two forms. It is kept in the form in which it was set; the other
// one is made anew on each reading.

#include <utility>

#include "module/markup/session/conversion_session.h"
#include "module/markup/shared/rtf_units.h"
#include "tz/mte/editor_state.h"
#include "tz/mte/globals.h"

namespace {

// What a conversion gives in the place of its result when the session's style cannot be had. A
// caller cannot tell it from a result. The control characters on the way to rich text were meant to
// make the function's name bold; they are part of the text.
struct FailureTexts {
    wchar_t const* noStyle;
    wchar_t const* noEntry;
};
constexpr FailureTexts kToRtfFailures = {
    L"\b1FindStyle\b0(GetStyle(), iStyleIndex) == FALSE",
    L"\b1GetStyleInfo\b0(iStyleIndex,Entry) == FALSE",
};
constexpr FailureTexts kToMarkupFailures = {
    L"FindStyle(GetStyle(), iStyleIndex) == FALSE",
    L"GetStyleInfo(iStyleIndex,Entry) == FALSE",
};

// The entry of the session's style; else the text about the step that failed.
wchar_t const*
findSessionStyle(CMTextEditorState& state, FailureTexts const& failures, CStyleInfoEntry& entry) {
    state.LoadStyles();
    int index = -1;
    if (!state.FindStyle(state.GetStyle(), index)) return failures.noStyle;
    return state.GetStyleInfo(index, entry) ? nullptr : failures.noEntry;
}

TextStart textStart(CMTextEditorState const& state, CStyleInfoEntry const& style) {
    TextStart start;
    start.font = {style.typeface, style.bold,           style.italic,
                  style.charset,  style.pitchAndFamily, style.fileName};
    start.size = state.GetInitialSize();
    start.twips = state.GetInitialTwipSize();
    start.color = state.GetInitialColor();
    start.byLayer = state.GetByLayerColor();
    start.byBlock = state.GetByBlockColor();
    return start;
}

}  // namespace

void CMTextEditorState::SetMTextString(CStdStrW const& text) {
    CreateWaitCursor();
    m_sText = text;
    m_bTextIsRTF = false;
}

void CMTextEditorState::SetRTFString(CStdStrW const& rtf) {
    CreateWaitCursor();
    m_sText = rtf;
    m_bTextIsRTF = true;
}

void CMTextEditorState::GetMTextString(CStdStrW& text) {
    CreateWaitCursor();
    if (m_bTextIsRTF)
        ConvertRTFToMText(m_sText, text);
    else
        text = m_sText;
    DestroyWaitCursor();
}

void CMTextEditorState::GetRTFString(CStdStrW& rtf) {
    CreateWaitCursor();
    if (m_bTextIsRTF)
        rtf = m_sText;
    else
        ConvertMTextToRTF(m_sText, rtf);
    DestroyWaitCursor();
}

void CMTextEditorState::ConvertMTextToRTF(CStdStrW const& text, CStdStrW& rtf) {
    CStyleInfoEntry style;
    if (wchar_t const* failure = findSessionStyle(*this, kToRtfFailures, style)) {
        rtf = failure;
        return;
    }
    WrittenRtf document =
        toRtf({&m_fontMap, &m_fontScale, &m_marginScale}, textStart(*this, style), text);
    MarkupFindings const& found = document.found;
    m_nIncidents = found.incidents;
    m_bStacksSeen = found.stacksSeen;
    SetTracking(found.wholeText.tracking);
    SetCharWidth(found.wholeText.charWidth);
    SetOblique(found.wholeText.oblique);
    SetVerticalAlignment(found.wholeText.baseAlignment);
    m_nMinSizeFound = found.minFontSize * kTwipsPerHalfPoint;
    m_nMaxSizeFound = found.maxFontSize * kTwipsPerHalfPoint;
    rtf = std::move(document.rtf);
}

// The size is that of the entity as it stands, which the dialog does not change; the findings of
// the other direction stay.
void CMTextEditorState::ConvertRTFToMText(CStdStrW const& rtf, CStdStrW& text) {
    CStyleInfoEntry style;
    if (wchar_t const* failure = findSessionStyle(*this, kToMarkupFailures, style)) {
        text = failure;
        return;
    }
    TextStart start = textStart(*this, style);
    start.size = g_dTextSize;
    WholeText const values = {m_dTracking, m_dCharWidth, m_dOblique, m_eVerticalAlignment};
    unsigned int const options =
        m_nEditorOptions & CRichTextToMTextContext::kKeepTrailingParagraphs;
    text = toMarkup({&m_fontMap, &m_fontScale, &m_marginScale}, start, values, options, rtf).markup;
}
