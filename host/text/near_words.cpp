#include "host/text/near_words.h"

#include <algorithm>

#include "tz/text/string.h"

namespace tzhost {
namespace {

constexpr std::size_t kLongest = 40;  // of what is compared: no name is longer

// The number of slips between two words, row by row of the table of their beginnings.
std::size_t slipsBetween(std::wstring_view a, std::wstring_view b) {
    std::vector<std::size_t> before(b.size() + 1);
    std::vector<std::size_t> row(b.size() + 1);
    std::vector<std::size_t> next(b.size() + 1);
    for (std::size_t j = 0; j <= b.size(); ++j)
        row[j] = j;
    for (std::size_t i = 1; i <= a.size(); ++i) {
        next[0] = i;
        for (std::size_t j = 1; j <= b.size(); ++j) {
            bool const isSame = tzToLower(a[i - 1]) == tzToLower(b[j - 1]);
            next[j] = std::min({row[j] + 1, next[j - 1] + 1, row[j - 1] + (isSame ? 0 : 1)});
            bool const isExchanged = i > 1 && j > 1 && tzToLower(a[i - 1]) == tzToLower(b[j - 2]) &&
                                     tzToLower(a[i - 2]) == tzToLower(b[j - 1]);
            if (isExchanged) next[j] = std::min(next[j], before[j - 2] + 1);
        }
        before = row;
        row = next;
    }
    return row[b.size()];
}

bool beginsWith(std::wstring const& word, std::wstring_view start) {
    return word.size() > start.size() &&
           std::equal(start.begin(), start.end(), word.begin(),
                      [](wchar_t a, wchar_t b) { return tzToLower(a) == tzToLower(b); });
}

std::wstring shortestWith(std::wstring_view start, std::vector<std::wstring> const& words) {
    std::wstring shortest;
    for (std::wstring const& each : words) {
        bool const isShorter = shortest.empty() || each.size() < shortest.size();
        if (isShorter && beginsWith(each, start)) shortest = each;
    }
    return shortest;
}

}  // namespace

std::wstring nearestWord(std::wstring_view typed, std::vector<std::wstring> const& words) {
    constexpr std::size_t kShort = 4;
    if (typed.size() < 2 || typed.size() > kLongest) return {};
    std::size_t least = (typed.size() <= kShort ? 1U : 2U) + 1;
    std::wstring nearest;
    for (std::wstring const& each : words) {
        if (each.size() > kLongest) continue;
        std::size_t const slips = slipsBetween(typed, each);
        if (slips >= least || slips >= each.size()) continue;
        least = slips;
        nearest = each;
    }
    return nearest.empty() ? shortestWith(typed, words) : nearest;
}

}  // namespace tzhost
