#include "module/markup/read_markup/stack_look_ahead.h"

#include <algorithm>

#include "module/markup/shared/number_text.h"
#include "tz/mte/globals.h"
#include "tz/text/code_page.h"

namespace {

constexpr std::size_t kUnicodeLength = 7;  // `\U+XXXX`; the five last are not looked at
constexpr std::size_t kFreeOfCharge = 4096;

// The signs are the characters of a list that runs on into the resource file's name, so that some
// letters count too.
bool isSign(wchar_t c) {
    return std::wstring_view(g_pszStackChars).find(c) != std::wstring_view::npos;
}

bool isUnicodeCode(std::wstring_view text, std::size_t at) {
    return at + 1 < text.size() && (text[at + 1] == L'u' || text[at + 1] == L'U');
}

// One step of the search for the ";": the place that is looked at next. The character after an
// escape pair is not looked at.
std::size_t nextToEnd(std::wstring_view text, std::size_t at) {
    return std::min(text.size(), at + (text[at] == L'\\' ? 3 : 1));
}

// One step of the search for a sign.
struct SignStep {
    bool isSign;
    std::size_t next;
};
SignStep nextToSign(std::wstring_view text, std::size_t at) {
    if (text[at] != L'\\') return {isSign(text[at]), at + 1};
    if (isUnicodeCode(text, at)) return {false, std::min(text.size(), at + kUnicodeLength)};
    bool const isPairSign = at + 1 < text.size() && isSign(text[at + 1]);
    return {isPairSign, std::min(text.size(), at + 2)};
}

}  // namespace

bool StackLookAhead::isStack(wchar_t const* start) {
    auto const at = static_cast<std::size_t>(start - text_.data());
    if (!ends_.empty()) return signs_[at] < ends_[at];
    return search(at);
}

bool StackLookAhead::search(std::size_t start) {
    std::size_t end = start;
    while (end < text_.size() && text_[end] != L';')
        end = nextToEnd(text_, end);
    std::wstring_view const part = text_.substr(0, end);
    for (std::size_t at = start; at < end;) {
        SignStep const step = nextToSign(part, at);
        if (step.isSign) return true;
        at = step.next;
    }
    spent_ += end - start;
    if (spent_ > text_.size() + kFreeOfCharge) workOutAll();
    return false;
}

void StackLookAhead::workOutAll() {
    std::size_t const size = text_.size();
    ends_.resize(size + 1, static_cast<Place>(size));
    signs_.resize(size + 1, static_cast<Place>(size));
    for (std::size_t at = size; at-- > 0;) {
        ends_[at] = text_[at] == L';' ? static_cast<Place>(at) : ends_[nextToEnd(text_, at)];
        SignStep const step = nextToSign(text_, at);
        signs_[at] = step.isSign ? static_cast<Place>(at) : signs_[step.next];
    }
}

std::wstring rebuiltStack(std::wstring_view text) {
    text = text.substr(0, text.find(L'\0'));
    std::wstring rebuilt;
    rebuilt.reserve(text.size());
    for (std::size_t at = 0; at < text.size();) {
        std::size_t const next = text[at] == L'\\' ? nextToSign(text, at).next : at + 1;
        if (isUnicodeCode(text, at) && text[at] == L'\\') {
            // The code is looked for in the stack's own text alone.
            int code = 0;
            getCIF(std::wstring(text.substr(at, kUnicodeLength)).c_str(), code);
            rebuilt += L"\\u";
            appendDecimal(rebuilt, code);
            rebuilt += L'?';
        } else {
            rebuilt.append(text, at, next - at);
        }
        at = next;
    }
    return rebuilt;
}
