#pragma once

// The words that a question takes beside its values, in the user's language and in the one that is
// the same everywhere.
//
//   auto const words = KeywordList::parse(L"Breite Höhe _Width Height");
//   words->match(L"b");        // 0: the capitals abbreviate a word
//   words->match(L"_height");  // 1: after "_" only global words count
//   words->global(1);          // "Height"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace tzhost {

class KeywordList {
public:
    KeywordList() = default;
    // Words with blanks between them, the local ones first; after " _" as many global ones.
    // Without " _" the words are both. Nothing when the two lists differ in length.
    [[nodiscard]] static std::optional<KeywordList> parse(std::wstring_view list);

    // The index of the word that an answer means: the word itself, its capitals, or a leading part
    // that holds all of them, without regard to case. The first word wins, local words before
    // global.
    [[nodiscard]] std::optional<int> match(std::wstring_view answer) const;
    // The index of the word that an answer is as a prompt shows it: with the blanks, equals signs
    // and parentheses that a word in a list cannot hold ("Line spacing" for Linespacing).
    [[nodiscard]] std::optional<int> matchShown(std::wstring_view answer) const;

    [[nodiscard]] bool isEmpty() const { return globals_.empty(); }
    [[nodiscard]] int count() const { return static_cast<int>(globals_.size()); }
    [[nodiscard]] std::wstring const& local(int index) const { return locals_[at(index)]; }
    [[nodiscard]] std::wstring const& global(int index) const { return globals_[at(index)]; }

private:
    static std::size_t at(int index) { return static_cast<std::size_t>(index); }

    std::vector<std::wstring> locals_;
    std::vector<std::wstring> globals_;  // as many as local ones
};

}  // namespace tzhost
