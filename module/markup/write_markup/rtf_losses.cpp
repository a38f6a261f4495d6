#include "module/markup/write_markup/rtf_losses.h"

#include <algorithm>
#include <array>

#include "module/markup/read_rtf/rtf_tokens.h"

namespace {

// Groups of documents without text that shows.
constexpr std::array<std::wstring_view, 5> kWithoutText = {L"info", L"listtable", L"pict",
                                                           L"revtbl", L"stylesheet"};

bool isBlank(wchar_t c) {
    return c == L' ' || c == L'\t' || c == L'\r' || c == L'\n';
}

}  // namespace

bool isTextLost(std::wstring_view word, wchar_t const* begin, wchar_t const* end) {
    if (std::find(kWithoutText.begin(), kWithoutText.end(), word) != kWithoutText.end())
        return false;
    while (begin < end) {
        RtfStep const step = nextStep(begin);
        if (step.kind == RtfStep::symbol) return true;
        if (step.kind == RtfStep::character && !isBlank(*step.start)) return true;
    }
    return false;
}

bool isMoreThanBlank(wchar_t const* cursor) {
    while (isBlank(*cursor) || *cursor == L'}')
        ++cursor;
    return *cursor != 0;
}
