// Groups, escaped characters and plain text.

#include "module/markup/read_rtf/rtf_characters.h"
#include "module/markup/read_rtf/rtf_tokens.h"
#include "module/markup/shared/ascii_set.h"
#include "module/markup/write_markup/rtf_to_mtext.h"

namespace {

// The characters that are no plain text.
constexpr AsciiSet kSigns(std::wstring_view(L"\0\n\r\\{}", 6));

}  // namespace

std::wstring_view CRichTextToMTextContext::GetToken(wchar_t const*& cursor, int& value) {
    return readControlWord(cursor, value);
}

// Ends at the "}" that closes more than was opened; what follows it is dropped. `\*` says that the
// group may be dropped when its next word is unknown.
void CRichTextToMTextContext::Convert(wchar_t const* cursor) {
    bool skipsDestination = false;
    bool isAfterFirst = false;
    bool isOpen = true;
    m_bCharEmitted = false;
    while (isOpen) {
        RtfStep const step = nextStep(cursor);
        switch (step.kind) {
        case RtfStep::end: isOpen = false; break;
        case RtfStep::open: onGroup(skipsDestination, isAfterFirst); break;
        case RtfStep::close:
            isOpen = onGroupEnd(skipsDestination, isAfterFirst);
            if (!isOpen) losses_.hasTextAfterEnd = isMoreThanBlank(cursor);
            break;
        case RtfStep::word:
            onWord(cursor, step, skipsDestination, isAfterFirst);
            isAfterFirst = true;
            break;
        case RtfStep::symbol:
            if (*cursor == L'*') {
                ++cursor;
                skipsDestination = true;
            } else {
                onSymbol(cursor);
            }
            isAfterFirst = true;
            break;
        case RtfStep::character:
            if (*step.start == L'\n' || *step.start == L'\r') break;
            while (cursor - step.start < kLongestRun && !kSigns.has(*cursor))
                ++cursor;
            onText(std::wstring_view(step.start, static_cast<std::size_t>(cursor - step.start)));
            break;
        }
    }
    if (!levels_.empty()) restore(levels_.front().look);
    levels_.clear();
}

void CRichTextToMTextContext::onGroup(bool& skipsDestination, bool& isAfterFirst) {
    levels_.push_back({current(), skipsDestination, isAfterFirst});
    skipsDestination = false;
    isAfterFirst = false;
    m_bCharEmitted = false;
}

// False when no group was open.
bool CRichTextToMTextContext::onGroupEnd(bool& skipsDestination, bool& isAfterFirst) {
    if (levels_.empty()) return false;
    Level const& level = levels_.back();
    restore(level.look);
    skipsDestination = level.skipsDestination;
    isAfterFirst = level.isAfterFirst;
    levels_.pop_back();
    return true;
}

// An unknown word drops its group when it opens it or follows a `\*`, else itself alone.
void CRichTextToMTextContext::onWord(wchar_t const*& cursor,
                                     RtfStep const& step,
                                     bool skipsDestination,
                                     bool isAfterFirst) {
    if (HandleToken(cursor, step.name, step.value)) return;
    bool const isOpening = !isAfterFirst && !m_bCharEmitted;
    wchar_t const* const rest = cursor;
    if (skipsDestination || isOpening) IgnoreToMatchingBrace(cursor);
    if (skipsDestination) return;  // the document says that this may be dropped
    if (isWordLost(step.name, step.value)) losses_.unknownWords.note(step.name);
    if (isOpening && isTextLost(step.name, rest, cursor)) losses_.texts.note(step.name);
}

// The character after a backslash: all but a few stand for themselves.
void CRichTextToMTextContext::onSymbol(wchar_t const*& cursor) {
    PreEmitChar();
    m_bSwallowTokens = false;
    if (*cursor == 0) return;
    wchar_t const c = *cursor++;
    switch (c) {
    case L'{':
    case L'}':
    case L'~':
        Append(L'\\');
        Append(c);
        break;
    case L'\'': Append(WideCharacterString(cursor, m_nCodePage).c_str()); break;
    case L'\\': onEscapedBackslash(cursor); break;
    default: Append(c); break;
    }
}

// An escaped backslash of the document. The markup doubles it, except where it begins the code of a
// character, and everywhere after a stack.
void CRichTextToMTextContext::onEscapedBackslash(wchar_t const*& cursor) {
    wchar_t const* const backslash = cursor - 1;
    if (*cursor == L'S') m_bSwallowTokens = m_bStackSeen = true;
    bool const isSingle = m_bInStack || getCIF(backslash) || getMIF(backslash);
    Append(isSingle ? L"\\" : L"\\\\");
    if (m_bSwallowTokens) Append(*cursor++);
}

void CRichTextToMTextContext::onText(std::wstring_view text) {
    PreEmitChar();
    m_bSwallowTokens = false;
    Append(text);
}

void CRichTextToMTextContext::PreEmitChar() {
    m_bCharEmitted = true;
    if (!IsEmissionPending()) return;
    codes_.clear();
    appendState(codes_);
    Append(std::wstring_view(codes_));
    Reset();
}
