// The pass over the markup: plain characters, braces, and the table of the codes.

#include <array>

#include "module/markup/read_markup/markup_numbers.h"
#include "module/markup/read_markup/stack_look_ahead.h"
#include "module/markup/shared/ascii_set.h"
#include "module/markup/shared/number_text.h"
#include "module/markup/write_rtf/mtext_to_rtf.h"
#include "tz/mte/font_map_database.h"
#include "tz/mte/globals.h"

// The codes by their letters. Everything else after a backslash is an unknown code.
struct MarkupCodes {
    using Context = CMTextToRichTextContext;
    struct Row {
        wchar_t letter;
        void (Context::*handler)(wchar_t const*&);
    };
    static constexpr Row kRows[] = {
        {L'A', &Context::onAlignment},    {L'C', &Context::onColorIndex},
        {L'F', &Context::onFontFile},     {L'H', &Context::onHeight},
        {L'L', &Context::onUnderline},    {L'M', &Context::onMultibyte},
        {L'O', &Context::onOverline},     {L'P', &Context::onParagraph},
        {L'Q', &Context::onOblique},      {L'S', &Context::onStack},
        {L'T', &Context::onTracking},     {L'U', &Context::onUnicode},
        {L'W', &Context::onCharWidth},    {L'\\', &Context::onEscape},
        {L'c', &Context::onColor},        {L'f', &Context::onFontFace},
        {L'l', &Context::onUnderlineOff}, {L'm', &Context::onMultibyte},
        {L'o', &Context::onOverlineOff},  {L'p', &Context::onParagraphSettings},
        {L'u', &Context::onUnicode},      {L'{', &Context::onEscape},
        {L'}', &Context::onEscape},       {L'~', &Context::onEscape},
    };
    static constexpr std::size_t kLetters = 128;

    static constexpr auto byLetter() {
        std::array<decltype(Row::handler), kLetters> handlers{};
        for (auto& handler : handlers)
            handler = &Context::onUnknown;
        for (Row const& row : kRows)
            handlers[static_cast<std::size_t>(row.letter)] = row.handler;
        return handlers;
    }
};

namespace {

constexpr AsciiSet kNotPlain(std::wstring_view(L"\0\n\\{}", 5));

// Whether a character is written as it is when nothing is pending.
bool isPlain(wchar_t c) {
    return AsciiSet::isAscii(c) && !kNotPlain.has(c);
}

}  // namespace

void CMTextToRichTextContext::convert(wchar_t const* cursor) {
    AppendToken(L"deftab", g_nDefaultTabTwips);
    while (*cursor != 0) {
        if (*cursor == L'\\') {
            ++cursor;
            convertCode(cursor);
            continue;
        }
        flushSize();
        if (isPlain(*cursor) && !needsFontSwap(*cursor)) {
            cursor = convertRun(cursor);
            continue;
        }
        convertCharacter(*cursor++);
    }
    AppendToken(L"par");
}

// Writes a run of plain characters in one piece.
wchar_t const* CMTextToRichTextContext::convertRun(wchar_t const* cursor) {
    wchar_t const* end = cursor + 1;
    while (end - cursor < kLongestRun && isPlain(*end))
        ++end;
    Append(std::wstring_view(cursor, static_cast<std::size_t>(end - cursor)));
    chars_ += end - cursor;
    m_dCurrentSize = top().effectiveSize;
    return end;
}

void CMTextToRichTextContext::convertCharacter(wchar_t c) {
    ++chars_;
    if (c == L'\n') {
        AppendToken(L"line");
    } else if (c == L'{' || c == L'}') {
        convertBrace(c);
    } else {
        bool const isSwapped = needsFontSwap(c);
        if (isSwapped) appendFontSwap(kAnsiCharset);
        appendUnicode(c);
        if (isSwapped) appendFontSwap(top().charset);
    }
    m_dCurrentSize = top().effectiveSize;
}

// Paragraph settings made inside a group stay in force after it, so that they are written again
// where the rich text's group has undone them.
void CMTextToRichTextContext::convertBrace(wchar_t brace) {
    ParagraphSettings const inner = top().paragraph;
    if (brace == L'{')
        PushState();
    else
        PopState();
    bool const isSwapped = needsFontSwap(brace);
    if (isSwapped) appendFontSwap(kAnsiCharset);
    Append(brace);
    if (isSwapped) appendFontSwap(top().charset);
    if (brace == L'}') UpdateParagraphSettings(inner);
}

// Only the bits 7 to 15 count, so that a character above 0xFFFF without them is written bare.
void CMTextToRichTextContext::appendUnicode(wchar_t c) {
    if ((c & 0xFF80) == 0) return Append(c);
    std::wstring text(L"\\u");
    appendDecimal(text, c);
    text += L'?';
    Append(std::wstring_view(text));
}

void CMTextToRichTextContext::flushSize() {
    if (m_nPendingFontSize == 0) return;
    AppendToken(L"fs", m_nPendingFontSize);
    m_nPendingFontSize = 0;
}

// Whether a Latin character stands in the initial font with a set that the font lacks.
bool CMTextToRichTextContext::needsFontSwap(wchar_t c) {
    if (swapState_ == SwapState::unknown) {
        State const& state = top();
        bool const isNeeded = state.charset != kAnsiCharset && !g_sInitialFont.isEmpty() &&
                              state.font.text() == g_sInitialFont.str() &&
                              !font_supports_charset(state.font.text().c_str(), state.charset);
        swapState_ = isNeeded ? SwapState::yes : SwapState::no;
    }
    return swapState_ == SwapState::yes && (c & 0xFF00) == 0;
}

// Also switches bold and italic off, so that the character after it is written without them.
void CMTextToRichTextContext::appendFontSwap(Charset charset) {
    State const& state = top();
    AppendToken(L"f", AddFont(state.font.text().c_str(), charset, state.pitchAndFamily));
    AppendToken(L"b", 0);
    AppendToken(L"i", 0);
}

void CMTextToRichTextContext::convertCode(wchar_t const*& cursor) {
    static constexpr auto kHandlers = MarkupCodes::byLetter();
    if (*cursor <= 0 || *cursor >= static_cast<wchar_t>(MarkupCodes::kLetters))
        return onUnknown(cursor);
    auto const handler = kHandlers[static_cast<std::size_t>(*cursor)];
    if (handler != &CMTextToRichTextContext::onUnknown) ++cursor;
    (this->*handler)(cursor);
}
