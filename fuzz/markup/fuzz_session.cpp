#include "fuzz/markup/fuzz_session.h"

#include <algorithm>

#include "host/text/utf8.h"

namespace markupfuzz {

namespace {

constexpr std::size_t kLongestResult = 4'000'000;
constexpr std::size_t kOneInSo = 8;

std::size_t backslashesIn(std::wstring_view text) {
    return static_cast<std::size_t>(std::count(text.begin(), text.end(), L'\\'));
}

// How far it is from the start of the text to the first of the ends.
std::size_t lengthUpTo(std::wstring_view text, std::wstring_view ends) {
    return std::min(text.find_first_of(ends), text.size());
}

}  // namespace

KeptFontMap::KeptFontMap() {
    static markuptest::OwnFontMap const kept;
}

std::wstring textOf(std::uint8_t const* data, std::size_t size) {
    std::string const bytes(data, std::find(data, data + size, std::uint8_t{0}));
    return tzhost::fromUtf8(bytes);
}

bool isLookedAtTwice(std::size_t size) {
    return size % kOneInSo == 0;
}

bool mayExplodeAsMarkup(std::wstring_view markup) {
    std::size_t longest = 0;
    for (std::size_t at = 0; (at = markup.find(L'\\', at)) < markup.size(); ++at) {
        std::wstring_view const name = markup.substr(std::min(at + 2, markup.size()));
        if (markup.size() - at < 2 || (markup[at + 1] != L'f' && markup[at + 1] != L'F')) continue;
        std::size_t const length = lengthUpTo(name, L";|");
        longest = std::max(longest, length);
        at += length;
    }
    return longest * backslashesIn(markup) > kLongestResult;
}

bool mayExplodeAsRtf(std::wstring_view rtf) {
    std::size_t const table = rtf.find(L"fonttbl");
    if (table == rtf.npos) return false;
    std::size_t longest = 0;
    std::wstring_view rest = rtf.substr(table);
    while (!rest.empty()) {
        std::size_t const length = lengthUpTo(rest, L";{");
        longest = std::max(longest, length);
        rest.remove_prefix(std::min(length + 1, rest.size()));
    }
    return longest * backslashesIn(rtf.substr(table)) > kLongestResult;
}

}  // namespace markupfuzz
