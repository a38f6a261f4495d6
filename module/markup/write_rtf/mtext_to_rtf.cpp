// Set-up, the document around the text, and the states.

#include "module/markup/write_rtf/mtext_to_rtf.h"

#include <algorithm>
#include <cwchar>

#include "module/fonts/font_entry.h"
#include "module/markup/read_markup/stack_look_ahead.h"
#include "module/markup/shared/number_text.h"
#include "module/markup/shared/rtf_units.h"
#include "module/styles/stack_defaults.h"
#include "tz/mte/font_map_database.h"
#include "tz/mte/globals.h"
#include "tz/mte/scale_correction.h"

namespace {

constexpr double kSizeInPlaceOfZero = 2.0;
constexpr double kFirstSize = 0.2;

}  // namespace

CMTextToRichTextContext::CMTextToRichTextContext(CMTextFontMapDatabase* fontMap,
                                                 CScaleCorrection* fontScale,
                                                 CScaleCorrection* marginScale)
    : m_eBaseAlignment(GetDefaultStackAlignment()), m_pFontMap(fontMap), m_pFontScale(fontScale),
      m_pMarginScale(marginScale) {
    m_aStates[0].effectiveSize = kFirstSize;
    updateSizes(m_nInitialFontSize);
}

CMTextToRichTextContext::~CMTextToRichTextContext() = default;

void CMTextToRichTextContext::ReportIncident(unsigned int incident) {
    if (incident == 0) return;
    m_nIncidents |= incident;
    incidentCounts_.note(incident);
}

void CMTextToRichTextContext::SetInitialFontName(
    wchar_t const* name, bool bold, bool italic, Charset charset, int pitchAndFamily) {
    auto const* const entry =
        fontEntry(*m_pFontMap, name, bold, italic, kAnsiCharset, pitchAndFamily);
    if (entry && entry->m_eMapType != CMTextFontMapDatabase::MapTypeSystem &&
        !entry->m_sFileName.empty()) {
        g_sInitialFont = name;
        SetFont(name);
        SetPitchAndFamily(pitchAndFamily);
        SetCharSet(charset);
    } else {
        g_sInitialFont.setEmpty();
        fontChanged();
    }
    AddFont(name, charset, pitchAndFamily);
    m_bBold = bold;
    m_bItalic = italic;
}

void CMTextToRichTextContext::SetInitialFontFileName(wchar_t const* file) {
    auto type = CMTextFontMapDatabase::MapTypeSystem;
    bool bold = false;
    bool italic = false;
    Charset charset = kAnsiCharset;
    int pitch = 0;
    CStdStrW const face = m_pFontMap->MapFileToFont(type, file, bold, italic, charset, pitch);
    SetFont(file);
    SetPitchAndFamily(pitch);
    SetCharSet(charset);
    g_sInitialFont = file;
    if (type == CMTextFontMapDatabase::MapTypeProxy) ReportIncident(kFontByProxy);
    SetInitialFontName(face.c_str(), bold, italic, charset, pitch);
}

void CMTextToRichTextContext::SetInitialFontSize(double size, int twips) {
    m_nInitialFontSize = twips / kTwipsPerHalfPoint;
    if (size == 0.0) size = kSizeInPlaceOfZero;
    m_dCurrentSize = size;
    SetEffectiveSize(size);
}

void CMTextToRichTextContext::SetFont(FontName const& font) {
    top().font = font;
    fontChanged();
}

void CMTextToRichTextContext::SetCharSet(Charset charset) {
    top().charset = charset;
    fontChanged();
}

void CMTextToRichTextContext::SetInitialFontColor(unsigned int rgb) {
    AddColor(rgb, false);
}

CStdStrW CMTextToRichTextContext::Parse(wchar_t const* text) {
    run(text, std::wcslen(text));
    return documentHead() + Close() + L"}";
}

CStdStrW CMTextToRichTextContext::parseOnce(std::wstring const& text) {
    run(text.c_str(), text.size());
    CStdStrW const head = documentHead();
    CStdStrW& body = Close();
    body += L'}';
    body.insert(0, head);
    return std::move(body);
}

void CMTextToRichTextContext::run(wchar_t const* text, std::size_t length) {
    startRun(text);
    updateSizes(m_nInitialFontSize);
    // Only an empty text keeps the system's stack alignment.
    if (*text != 0) m_eBaseAlignment = kAlignBottom;
    // More than needed: untouched pages cost nothing, while growing would copy the text.
    reserve(length + length / 2);
    convert(text);
}

// What was learned of an earlier text does not hold for this one, so it is dropped.
void CMTextToRichTextContext::startRun(wchar_t const* text) {
    if (!isOpen()) Grow();
    chars_ = 0;
    lastFactor_ = 1.0;
    fontCodes_.clear();
    fontChanged();
    text_ = text;
    stacks_.reset();
}

// Everything before the text. Font 0 and colour 0 are the initial ones.
CStdStrW CMTextToRichTextContext::documentHead() const {
    CStdStrW head(L"{\\rtf1\\ansi");
    head += EmitFontTable();
    head += L"\r\n";
    head += EmitColorTable();
    head += L"\r\n\\pard\\plain\\f0\\cf0\\fs";
    appendDecimal(head, m_nInitialFontSize);
    if (m_bBold) head += L"\\b";
    if (m_bItalic) head += L"\\i";
    head += L' ';
    return head;
}

void CMTextToRichTextContext::updateSizes(int halfPoints) {
    m_nMinFontSize = std::min(m_nMinFontSize, halfPoints);
    m_nMaxFontSize = std::max(m_nMaxFontSize, halfPoints);
    m_nCurrentFontSize = halfPoints;
}

// When there are kMostStates states, a further group gets none of its own, and its closing brace
// ends the state of a group around it.
void CMTextToRichTextContext::PushState() {
    if (m_nState + 1 == kMostStates) return;
    State const& outer = top();
    ++m_nState;
    top() = outer;
    top().paragraph.isSet = true;
    fontChanged();
}

void CMTextToRichTextContext::PopState() {
    if (m_nState == 0) return;
    --m_nState;
    fontChanged();
}

void CMTextToRichTextContext::AppendToken(wchar_t const* word) {
    Append(L'\\');
    Append(word);
    Append(L' ');
}

void CMTextToRichTextContext::AppendToken(wchar_t const* word, long long value) {
    std::wstring text(1, L'\\');
    text += word;
    appendDecimal(text, value);
    text += L' ';
    Append(std::wstring_view(text));
}
