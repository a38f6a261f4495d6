#pragma once

#include "tz/text/array.h"
#include "tz/text/string.h"

// The keywords of one question, by the ids of their texts. Each text reads "local words _global
// word": the local part is the translator's and may hold a comma, after which words stand that
// only serve to match; the global one is the same in every language. Blanks, "=", "(" and ")" are
// no part of what is matched.
//
//   unsigned int const ids[] = {1084, 1085};
//   CKeywordTable table(ids, 2);
//   table.LoadStrings();
//   unsigned int id;
//   if (table.FindKeyword(L"Exactly", id)) ...
//
// The order of ids is the prompt's order. The array is borrowed and must outlive the table.
class CKeywordTable {
public:
    CKeywordTable() = default;
    CKeywordTable(unsigned int const* ids, int count);
    CKeywordTable(CKeywordTable const& other) = default;
    CKeywordTable& operator=(CKeywordTable const& other) = default;

    // How many keywords there are.
    [[nodiscard]] int GetCount() const { return keywordCount; }
    // Reads the texts; what follows needs them.
    void LoadStrings();
    // The two parts of the text at `index`. A text without a separator is the local part whole, and
    // the global one is then what stands after its first character.
    void GetKeywords(int index, TzString& local, TzString& global) const;
    // `index` must be one of the table's.
    [[nodiscard]] unsigned int GetKeywordID(int index) const { return keywordIds[index]; }
    // The first keyword whose global word is `input`, whatever its case; false, and an id of 0,
    // when there is none.
    [[nodiscard]] bool FindKeyword(TzString const& input, unsigned int& id) const;
    // One part of the keyword with that id; empty when the table lacks it.
    [[nodiscard]] TzString GetKeywordString(unsigned int id, bool local) const;

private:
    unsigned int const* keywordIds = nullptr;
    int keywordCount = 0;
    TzArray<TzString> keywordStrings;
};

// The text without any of " =()", as the host matches it.
[[nodiscard]] TzString FormatAsKeyword(TzString text);
// What stands before the first comma, as the prompt shows it.
[[nodiscard]] TzString FormatAsPromptOption(TzString text);
