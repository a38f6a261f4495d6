// Keyword texts taken apart, joined for the host, matched with answers.

#include "module/prompt/keyword_table.h"

#include <gtest/gtest.h>

#include "tests/module_ground/own_texts.h"
#include "tests/prompt/texts.h"

namespace {

struct KeywordRow {
    char const* name;
    unsigned int id;
    wchar_t const* text;
    wchar_t const* local;
    wchar_t const* global;
    wchar_t const* word;    // what the host matches, of the local part
    wchar_t const* option;  // what the prompt shows
};
constexpr KeywordRow kKeywords[] = {
    {"Plain", kTopLeft, L"TL _TL", L"TL", L"TL", L"TL", L"TL"},
    {"Comma", kWithComma, L"Two words,Alias _Twowords", L"Two words,Alias", L"Twowords",
     L"Twowords,Alias", L"Two words"},
    {"ManyWords", kManyWords, L"A = (b c) _G (h)", L"A = (b c)", L"G (h)", L"Abc", L"A = (b c)"},
    {"NoSeparator", kNoSeparator, L"Word", L"Word", L"ord", L"Word", L"Word"},
    {"Translated", kTranslated, L"Höhe _Height", L"Höhe", L"Height", L"Höhe", L"Höhe"},
    {"SameGlobal", kSameGlobal, L"Altezza _Height", L"Altezza", L"Height", L"Altezza", L"Altezza"},
};

int const kTextCount = [] {
    tzhost::ResourceTexts texts;
    for (KeywordRow const& row : kKeywords)
        texts[row.id] = row.text;
    return ownTexts(texts);
}();

class KeywordTexts : public testing::TestWithParam<KeywordRow> {};
TEST_P(KeywordTexts, ComeApart) {
    KeywordRow const& row = GetParam();
    CKeywordTable table(&row.id, 1);
    table.LoadStrings();
    TzString local;
    TzString global;
    table.GetKeywords(0, local, global);
    EXPECT_EQ(local.str(), row.local);
    EXPECT_EQ(global.str(), row.global);
    EXPECT_EQ(FormatAsKeyword(local).str(), row.word);
    EXPECT_EQ(FormatAsPromptOption(local).str(), row.option);
    EXPECT_EQ(table.GetKeywordString(row.id, true), local);
    EXPECT_EQ(table.GetKeywordString(row.id, false), global);
    EXPECT_TRUE(table.GetKeywordString(row.id + 100, true).isEmpty());
}
INSTANTIATE_TEST_SUITE_P(Forms, KeywordTexts, testing::ValuesIn(kKeywords), [](auto const& row) {
    return row.param.name;
});

struct FindRow {
    wchar_t const* input;
    unsigned int id;  // 0: not found
};
constexpr FindRow kFinds[] = {
    {L"TL", kTopLeft},
    {L"tl", kTopLeft},
    {L"Gh", kManyWords},
    {L"G (h)", 0},
    // The first of two keywords with one global word wins; local words are not looked at.
    {L"HEIGHT", kTranslated},
    {L"Höhe", 0},
    {L"T", 0},
    {L"", 0},
};
TEST(KeywordTable, FindsByTheGlobalWordAlone) {
    constexpr unsigned int kIds[] = {kTopLeft, kManyWords, kTranslated, kSameGlobal};
    CKeywordTable table(kIds, 4);
    table.LoadStrings();
    for (FindRow const& row : kFinds) {
        unsigned int id = 77;
        EXPECT_EQ(table.FindKeyword(row.input, id), row.id != 0) << row.input;
        EXPECT_EQ(id, row.id) << row.input;
    }
    unsigned int id = 77;
    EXPECT_FALSE(CKeywordTable().FindKeyword(L"TL", id));
    EXPECT_EQ(id, 0U);
}

TEST(KeywordTable, CopiesItsTexts) {
    EXPECT_EQ(kTextCount, 6);
    constexpr unsigned int kIds[] = {kTranslated, kTopLeft};
    CKeywordTable table(kIds, 2);
    table.LoadStrings();
    CKeywordTable const copy(table);
    EXPECT_EQ(copy.GetCount(), 2);
    EXPECT_EQ(copy.GetKeywordID(1), kTopLeft);
    EXPECT_EQ(copy.GetKeywordString(kTranslated, false), L"Height");
}

TEST(PromptOptions, EndAtTheFirstComma) {
    EXPECT_EQ(FormatAsPromptOption(L"one two,three,four"), L"one two");
    EXPECT_EQ(FormatAsPromptOption(L""), L"");
    EXPECT_EQ(FormatAsPromptOption(L",x"), L"");
    EXPECT_EQ(FormatAsKeyword(L"= (a b)"), L"ab");
    EXPECT_EQ(FormatAsKeyword(L" =()"), L"");
}

}  // namespace
