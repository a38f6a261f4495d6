#include "host/command_line/keyword_list.h"

#include <algorithm>

#include "host/runtime/words.h"
#include "tz/text/string.h"

namespace tzhost {

namespace {

constexpr std::wstring_view kGlobalMark = L" _";
// What words of prompts may hold and words of lists may not.
constexpr std::wstring_view kShownOnly = L" =()";

std::vector<std::wstring> wordsOf(std::wstring_view list) {
    Words const words = splitWords(list);
    return {words.begin(), words.end()};
}

bool isCapital(wchar_t c) {
    return tzToLower(c) != c;
}

bool isMeant(std::wstring_view answer, std::wstring_view word) {
    if (isSameWord(answer, word)) return true;
    std::wstring capitals;
    std::size_t holdsAll = 0;  // the length of the shortest leading part with every capital
    for (std::size_t i = 0; i < word.size(); ++i) {
        if (!isCapital(word[i])) continue;
        capitals += word[i];
        holdsAll = i + 1;
    }
    if (capitals.empty()) return false;
    if (isSameWord(answer, capitals)) return true;
    return answer.size() >= holdsAll && isSameWord(answer, word.substr(0, answer.size()));
}

std::optional<int> findMeant(std::wstring_view answer, std::vector<std::wstring> const& words) {
    for (std::size_t i = 0; i < words.size(); ++i) {
        if (isMeant(answer, words[i])) return static_cast<int>(i);
    }
    return std::nullopt;
}

std::optional<int> findSame(std::wstring_view answer, std::vector<std::wstring> const& words) {
    auto const found = std::ranges::find_if(
        words, [answer](std::wstring const& word) { return isSameWord(answer, word); });
    if (found == words.end()) return std::nullopt;
    return static_cast<int>(found - words.begin());
}

}  // namespace

std::optional<KeywordList> KeywordList::parse(std::wstring_view list) {
    KeywordList result;
    std::size_t const mark = list.find(kGlobalMark);
    result.locals_ = wordsOf(list.substr(0, mark));
    result.globals_ = mark == std::wstring_view::npos
                          ? result.locals_
                          : wordsOf(list.substr(mark + kGlobalMark.size()));
    if (result.locals_.size() != result.globals_.size()) return std::nullopt;
    return result;
}

std::optional<int> KeywordList::match(std::wstring_view answer) const {
    if (answer.empty()) return std::nullopt;
    if (answer.front() == L'_') return findMeant(answer.substr(1), globals_);
    auto const local = findMeant(answer, locals_);
    return local ? local : findMeant(answer, globals_);
}

std::optional<int> KeywordList::matchShown(std::wstring_view answer) const {
    std::wstring word(answer);
    std::erase_if(word, [](wchar_t c) { return kShownOnly.find(c) != kShownOnly.npos; });
    if (word.size() == answer.size()) return std::nullopt;
    auto const local = findSame(word, locals_);
    return local ? local : findSame(word, globals_);
}

}  // namespace tzhost
