#include "host/runtime/words.h"

#include <algorithm>

#include "tz/text/string.h"

namespace tzhost {

namespace {

constexpr std::wstring_view kBlanks = L" \t";

}  // namespace

Words splitWords(std::wstring_view text) {
    Words words;
    for (std::size_t start = text.find_first_not_of(kBlanks); start != text.npos;
         start = text.find_first_not_of(kBlanks)) {
        text.remove_prefix(start);
        words.push_back(text.substr(0, text.find_first_of(kBlanks)));
        text.remove_prefix(words.back().size());
    }
    return words;
}

std::wstring_view withoutBlanksAround(std::wstring_view text) {
    text.remove_prefix(std::min(text.size(), text.find_first_not_of(kBlanks)));
    return text.substr(0, text.find_last_not_of(kBlanks) + 1);
}

bool isSameWord(std::wstring_view a, std::wstring_view b) {
    return std::equal(a.begin(), a.end(), b.begin(), b.end(),
                      [](wchar_t x, wchar_t y) { return tzToLower(x) == tzToLower(y); });
}

}  // namespace tzhost
