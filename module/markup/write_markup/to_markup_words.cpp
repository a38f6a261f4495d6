// What the control words do.

#include <algorithm>
#include <array>

#include "module/markup/read_rtf/color_table_reader.h"
#include "module/markup/read_rtf/font_table_reader.h"
#include "module/markup/read_rtf/rtf_characters.h"
#include "module/markup/read_rtf/rtf_tokens.h"
#include "module/markup/shared/number_text.h"
#include "module/markup/shared/rtf_units.h"
#include "module/markup/shared/wrapping.h"
#include "module/markup/write_markup/rtf_to_mtext.h"
#include "module/texts/resources.h"
#include "module/texts/text_ids.h"
#include "tz/mte/scale_correction.h"

// The words in alphabetical order; what is not among them is unknown.
struct RtfWords {
    using Context = CRichTextToMTextContext;
    struct Row {
        std::wstring_view word;
        void (Context::*handler)(wchar_t const*&, int);
    };
    static constexpr Row kRows[] = {
        {L"ansicpg", &Context::OnCodePage},
        {L"b", &Context::OnBold},
        {L"cf", &Context::OnForegroundColor},
        {L"colortbl", &Context::OnColorTable},
        {L"cpg", &Context::OnCodePage},
        {L"deff", &Context::OnNothing},
        {L"dn", &Context::OnBaselineDown},
        {L"emdash", &Context::OnEmDash},
        {L"emspace", &Context::OnEmSpace},
        {L"endash", &Context::OnEnDash},
        {L"enspace", &Context::OnEnSpace},
        {L"f", &Context::OnFont},
        {L"fonttbl", &Context::OnFontTable},
        {L"fs", &Context::OnFontSize},
        {L"i", &Context::OnItalic},
        {L"lang", &Context::OnNothing},
        {L"ldblquote", &Context::OnLeftDoubleQuote},
        {L"line", &Context::OnLineBreak},
        {L"lquote", &Context::OnLeftSingleQuote},
        {L"par", &Context::OnParagraph},
        {L"pard", &Context::OnDefaultParagraph},
        {L"plain", &Context::OnPlain},
        {L"pntext", &Context::OnPnText},
        {L"rdblquote", &Context::OnRightDoubleQuote},
        {L"rquote", &Context::OnRightSingleQuote},
        {L"rtf", &Context::OnNothing},
        {L"strike", &Context::OnStrikethrough},
        {L"tab", &Context::OnTab},
        {L"u", &Context::OnUnicode},
        {L"ul", &Context::OnUnderline},
        {L"ulnone", &Context::OnUnderlineOff},
        {L"up", &Context::OnBaselineUp},
    };

    static constexpr bool isSorted() {
        return std::is_sorted(std::begin(kRows), std::end(kRows),
                              [](Row const& a, Row const& b) { return a.word < b.word; });
    }
};

// A character that is no word of the markup: a text of the resource library, else a plain one.
struct CRichTextToMTextContext::Replacement {
    int id;
    wchar_t const* fallback;
};

namespace {

static_assert(RtfWords::isSorted());

constexpr int kUsualBaseline = 6;

enum ReplacementPlace : std::size_t {
    kEmDash,
    kEnDash,
    kLeftSingleQuote,
    kRightSingleQuote,
    kLeftDoubleQuote,
    kRightDoubleQuote,
};

constexpr std::size_t kLetters = L'z' - L'a' + 1;

constexpr std::size_t letterOf(std::wstring_view word) {
    return static_cast<std::size_t>(word.front() - L'a');
}

// The first row of each letter or after it, and one place more for the end of all.
constexpr auto firstsByLetter() {
    std::array<RtfWords::Row const*, kLetters + 1> firsts{};
    for (std::size_t letter = 0; letter <= kLetters; ++letter) {
        firsts[letter] =
            std::find_if(std::begin(RtfWords::kRows), std::end(RtfWords::kRows),
                         [=](RtfWords::Row const& row) { return letterOf(row.word) >= letter; });
    }
    return firsts;
}

// Null for an unknown word.
RtfWords::Row const* rowOf(std::wstring_view word) {
    static constexpr auto kFirsts = firstsByLetter();
    if (word.empty() || word.front() < L'a' || word.front() > L'z') return nullptr;
    std::size_t const letter = letterOf(word);
    auto const* const end = kFirsts[letter + 1];
    auto const* const row = std::find_if(
        kFirsts[letter], end, [=](RtfWords::Row const& each) { return each.word == word; });
    return row == end ? nullptr : row;
}

}  // namespace

bool CRichTextToMTextContext::HandleToken(wchar_t const*& cursor,
                                          std::wstring_view word,
                                          int value) {
    RtfWords::Row const* const row = rowOf(word);
    if (row && !m_bSwallowTokens) (this->*row->handler)(cursor, value);
    return row != nullptr;
}

void CRichTextToMTextContext::OnNothing(wchar_t const*&, int) {}

void CRichTextToMTextContext::OnParagraph(wchar_t const*&, int) {
    PreEmitChar();
    Append(L"\\P");
}

void CRichTextToMTextContext::OnLineBreak(wchar_t const*&, int) {
    PreEmitChar();
    Append(L'\n');
}

void CRichTextToMTextContext::OnTab(wchar_t const*&, int) {
    PreEmitChar();
    Append(L'\t');
}

// Leaves character set and pitch as they are.
void CRichTextToMTextContext::OnPlain(wchar_t const*&, int) {
    SetFontName(base().m_sFontName);
    SetColor(base().m_nColorIndex, base().m_nRGB);
    SetFontSize(base().m_dSize);
    SetBold(false);
    SetItalic(false);
    SetUnderline(false);
    SetStrikethrough(false);
}

void CRichTextToMTextContext::OnFont(wchar_t const*&, int value) {
    Record const* const font = fontAt(value);
    if (!font) {
        SetFontName(base().m_sFontName);
        SetBold(base().m_bBold);
        SetItalic(base().m_bItalic);
        return;
    }
    SetFontName(font->name);
    SetCharSet(font->charset);
    SetPitchAndFamily(font->pitchAndFamily);
    m_nCodePage = TzCodePage::CharSetToCodePageId(font->charset);
}

void CRichTextToMTextContext::OnForegroundColor(wchar_t const*&, int value) {
    int index = 0;
    unsigned int rgb = 0;
    if (GetColor(value, &index) && GetColor(value, rgb)) SetColor(index, rgb);
}

void CRichTextToMTextContext::OnFontSize(wchar_t const*&, int value) {
    SetFontSize(value >= 1
                    ? m_pFontScale->ScaleTwipsToUnits(wrappingProduct(value, kTwipsPerHalfPoint))
                    : base().m_dSize);
}

void CRichTextToMTextContext::OnBold(wchar_t const*&, int value) {
    SetBold(value != 0);
}

void CRichTextToMTextContext::OnItalic(wchar_t const*&, int value) {
    SetItalic(value != 0);
}

void CRichTextToMTextContext::OnUnderline(wchar_t const*&, int value) {
    SetUnderline(value != 0);
}

void CRichTextToMTextContext::OnUnderlineOff(wchar_t const*&, int) {
    SetUnderline(false);
}

void CRichTextToMTextContext::OnStrikethrough(wchar_t const*&, int value) {
    SetStrikethrough(value != 0);
}

void CRichTextToMTextContext::OnBaselineUp(wchar_t const*&, int value) {
    SetBaseAlignment(value != 0 ? kAlignTop : kAlignMiddle, 0);
    m_bInStack = false;
}

void CRichTextToMTextContext::OnBaselineDown(wchar_t const*&, int value) {
    if (value == kNoValue) value = kUsualBaseline;
    m_bInStack = value == kStackMarker;
    if (!m_bInStack) SetBaseAlignment(value == 0 ? kAlignMiddle : kAlignBottom, 1);
}

void CRichTextToMTextContext::OnCodePage(wchar_t const*&, int value) {
    m_nCodePage = value;
}

// Spaces, dashes and quotes leave a change of the look pending, which is written after them.
void CRichTextToMTextContext::OnEmSpace(wchar_t const*&, int) {
    Append(L"  ");
}

void CRichTextToMTextContext::OnEnSpace(wchar_t const*&, int) {
    Append(L' ');
}

void CRichTextToMTextContext::appendReplacement(std::size_t which) {
    static constexpr Replacement kReplacements[] = {
        {kText.emDash, L"--"},    {kText.enDash, L"-"},           {kText.leftQuote, L"'"},
        {kText.rightQuote, L"'"}, {kText.leftDoubleQuote, L"\""}, {kText.rightDoubleQuote, L"\""},
    };
    TzString& text = replacements_[which];
    if (text.isEmpty()) text = loadResourceString(kReplacements[which].id);
    if (text.isEmpty()) text = kReplacements[which].fallback;
    Append(text.kwszPtr());
}

void CRichTextToMTextContext::OnEmDash(wchar_t const*&, int) {
    appendReplacement(kEmDash);
}

void CRichTextToMTextContext::OnEnDash(wchar_t const*&, int) {
    appendReplacement(kEnDash);
}

void CRichTextToMTextContext::OnLeftSingleQuote(wchar_t const*&, int) {
    appendReplacement(kLeftSingleQuote);
}

void CRichTextToMTextContext::OnRightSingleQuote(wchar_t const*&, int) {
    appendReplacement(kRightSingleQuote);
}

void CRichTextToMTextContext::OnLeftDoubleQuote(wchar_t const*&, int) {
    appendReplacement(kLeftDoubleQuote);
}

void CRichTextToMTextContext::OnRightDoubleQuote(wchar_t const*&, int) {
    appendReplacement(kRightDoubleQuote);
}

// The one character after the word is always dropped as its substitute, even a backslash.
void CRichTextToMTextContext::OnUnicode(wchar_t const*& cursor, int value) {
    (void)GetCharacterMBCS(cursor, m_nCodePage);  // not shown
    PreEmitChar();
    CStdStrW code(L"\\U+");
    appendHex4(code, static_cast<unsigned int>(value));
    Append(std::wstring_view(code));
}

void CRichTextToMTextContext::OnColorTable(wchar_t const*& cursor, int) {
    readColorTable(cursor, *this);
}

void CRichTextToMTextContext::OnFontTable(wchar_t const*& cursor, int) {
    readFontTable(cursor, *this);
}

// The number or bullet of a list as plain text, up to the end of its group, whose brace is left to
// the reader of groups. A `\pntext` inside it reads on to the same end, so it needs no reading of
// its own.
void CRichTextToMTextContext::OnPnText(wchar_t const*& cursor, int) {
    for (;;) {
        RtfStep const step = nextStep(cursor);
        switch (step.kind) {
        case RtfStep::end: return;
        case RtfStep::close: cursor = step.start; return;
        case RtfStep::open: skipGroupRest(cursor); break;
        case RtfStep::word:
            if (step.name != L"pntext") HandleToken(cursor, step.name, step.value);
            break;
        case RtfStep::symbol: onSymbol(cursor); break;
        case RtfStep::character:
            PreEmitChar();
            Append(*step.start);
            break;
        }
    }
}
