#include "module/markup/write_markup/rtf_losses.h"

#include <algorithm>
#include <array>

#include "module/markup/read_rtf/rtf_tokens.h"

namespace {

// Groups of documents without text that shows.
constexpr std::array<std::wstring_view, 5> kWithoutText = {L"info", L"listtable", L"pict",
                                                           L"revtbl", L"stylesheet"};

// Words that tell of the file, of its page or of the screen, and those of paragraphs, which `\pard`
// reads ahead. In alphabetical order.
constexpr std::array<std::wstring_view, 18> kWithoutLoss = {
    L"ansi",   L"deflang", L"deflangfe", L"deftab",   L"fi",        L"langfe",
    L"li",     L"margb",   L"margl",     L"margr",    L"margt",     L"noproof",
    L"paperh", L"paperw",  L"tx",        L"viewkind", L"viewscale", L"widowctrl"};
static_assert(std::is_sorted(kWithoutLoss.begin(), kWithoutLoss.end()));

constexpr int kUsualSubstitutes = 1;  // of a `\u`, as they are dropped

bool isBlank(wchar_t c) {
    return c == L' ' || c == L'\t' || c == L'\r' || c == L'\n';
}

}  // namespace

bool isWordLost(std::wstring_view word, int value) {
    if (word == L"uc") return value != kUsualSubstitutes;
    return !std::binary_search(kWithoutLoss.begin(), kWithoutLoss.end(), word);
}

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
