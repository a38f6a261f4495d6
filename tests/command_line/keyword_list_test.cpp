// Which answers mean which keyword.

#include <gtest/gtest.h>

#include "host/command_line/keyword_list.h"

namespace {

using tzhost::KeywordList;

struct MatchRow {
    char const* name;
    std::wstring_view list;
    std::wstring_view answer;
    std::wstring_view global;  // empty: no keyword
};

constexpr MatchRow kMatches[] = {
    {"WholeWord", L"Style Rotate", L"rotate", L"Rotate"},
    {"Capital", L"Style Rotate", L"R", L"Rotate"},
    {"LeadingPart", L"Style Rotate", L"roTA", L"Rotate"},
    {"NotALeadingPart", L"Style Rotate", L"rotx", L""},
    {"LongerThanTheWord", L"Style Rotate", L"rotates", L""},
    {"InnerCapital", L"alIgnment", L"i", L"alIgnment"},
    {"UpToInnerCapital", L"alIgnment", L"ali", L"alIgnment"},
    {"BeyondIt", L"alIgnment", L"alIg", L"alIgnment"},
    {"ShortOfIt", L"alIgnment", L"al", L""},
    {"AllCapitals", L"TL TC", L"tc", L"TC"},
    {"OneOfTwoCapitals", L"TL TC", L"t", L""},
    {"FirstWins", L"Set Style", L"s", L"Set"},
    {"LocalBeforeGlobal", L"Höhe Width _Width Height", L"w", L"Height"},
    {"GlobalToo", L"Breite Höhe _Width Height", L"height", L"Height"},
    {"GlobalOnly", L"Höhe Width _Width Height", L"_W", L"Width"},
    {"LocalBehindMark", L"Breite _Width", L"_breite", L""},
    {"BeyondAscii", L"Änderung _Change", L"ä", L"Change"},
    {"NoCapitals", L"all", L"a", L""},
    {"NoCapitalsWhole", L"all", L"ALL", L"all"},
    {"Empty", L"Style", L"", L""},
    {"MarkAlone", L"Style", L"_", L""},
    {"ManyBlanks", L"  Style   Rotate  ", L"r", L"Rotate"},
};

class Keyword : public testing::TestWithParam<MatchRow> {};
TEST_P(Keyword, IsMeantBy) {
    auto const words = KeywordList::parse(GetParam().list);
    ASSERT_TRUE(words);
    auto const index = words->match(GetParam().answer);
    EXPECT_EQ(index ? words->global(*index) : L"", GetParam().global);
}
INSTANTIATE_TEST_SUITE_P(Answers, Keyword, testing::ValuesIn(kMatches), [](auto const& row) {
    return row.param.name;
});

// Only the whole word: a piece with blanks was hardly meant.
TEST(KeywordLists, TakeWordsAsPromptsShowThem) {
    auto const words = KeywordList::parse(L"Zeilenabstand Exakt _Linespacing Exactly");
    for (wchar_t const* const answer : {L"line spacing", L"Line (spacing)", L"Zeilen abstand"})
        EXPECT_EQ(words->matchShown(answer), 0) << answer;
    for (wchar_t const* const answer : {L"Line sp", L"Linespacing", L"", L" "})
        EXPECT_EQ(words->matchShown(answer), std::nullopt) << answer;
}

TEST(KeywordLists, MustBeEquallyLong) {
    EXPECT_FALSE(KeywordList::parse(L"One Two _One"));
    EXPECT_FALSE(KeywordList::parse(L"One _"));
    EXPECT_TRUE(KeywordList::parse(L"")->isEmpty());
}

}  // namespace
