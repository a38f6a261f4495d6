// Groups, escaped characters and plain text.

#include "module/markup/ascii_set.h"
#include "module/markup/rtf_reading.h"
#include "module/markup/rtf_to_mtext.h"
#include "module/markup/rtf_tokens.h"

namespace {

// The characters that are no plain text.
constexpr AsciiSet kSigns(std::wstring_view(L"\0\n\r\\{}", 6));

// A longer run of text is copied in pieces, which are then still in the cache.
constexpr std::ptrdiff_t kLongestRun = 2048;

}  // namespace

std::wstring_view CRichTextToMTextContext::GetToken(wchar_t const*& cursor, int& value) {
    return readControlWord(cursor, value);
}

// Ends at the "}" that closes more than was opened; what stands behind it is dropped.
void CRichTextToMTextContext::Convert(wchar_t const* cursor) {
    bool skipsDestination = false;
    bool isBehindFirst = false;
    bool isOpen = true;
    m_bCharEmitted = false;
    while (isOpen && *cursor != 0) {
        wchar_t const* const start = cursor++;
        switch (*start) {
        case L'{': onGroup(skipsDestination, isBehindFirst); break;
        case L'}': isOpen = onGroupEnd(skipsDestination, isBehindFirst); break;
        case L'\n':
        case L'\r': break;
        case L'\\':
            onBackslash(cursor, skipsDestination, isBehindFirst);
            isBehindFirst = true;
            break;
        default:
            while (cursor - start < kLongestRun && !kSigns.has(*cursor))
                ++cursor;
            onText(std::wstring_view(start, static_cast<std::size_t>(cursor - start)));
            break;
        }
    }
    if (!levels_.empty()) restore(levels_.front().look);
    levels_.clear();
}

void CRichTextToMTextContext::onGroup(bool& skipsDestination, bool& isBehindFirst) {
    levels_.push_back({current(), skipsDestination, isBehindFirst});
    skipsDestination = false;
    isBehindFirst = false;
    m_bCharEmitted = false;
}

// False when no group was open.
bool CRichTextToMTextContext::onGroupEnd(bool& skipsDestination, bool& isBehindFirst) {
    if (levels_.empty()) return false;
    Level const& level = levels_.back();
    restore(level.look);
    skipsDestination = level.skipsDestination;
    isBehindFirst = level.isBehindFirst;
    levels_.pop_back();
    return true;
}

// An unknown word drops its group when it opens it or stands behind a `\*`, else itself alone.
void CRichTextToMTextContext::onBackslash(wchar_t const*& cursor,
                                          bool& skipsDestination,
                                          bool isBehindFirst) {
    int value = 0;
    std::wstring_view const word = GetToken(cursor, value);
    if (!word.empty()) {
        if (HandleToken(cursor, word, value)) return;
        bool const isOpening = !isBehindFirst && !m_bCharEmitted;
        if (skipsDestination || isOpening) IgnoreToMatchingBrace(cursor);
    } else if (*cursor == L'*') {
        ++cursor;
        skipsDestination = true;
    } else {
        onSymbol(cursor);
    }
}

// The character behind a backslash: all but a few stand for themselves.
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

// A backslash of the text, which the markup has doubled; single where it begins a character's code,
// and everywhere behind a stack.
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
