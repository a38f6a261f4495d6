// The interface's small values: strings, arrays and value records at the ends of what they hold.

#include <gtest/gtest.h>

#include "tz/rx/resbuf.h"
#include "tz/rx/status.h"
#include "tz/text/array.h"
#include "tz/text/string.h"

namespace {

struct PartRow {
    char const* name;
    int start, count;
    wchar_t const* part;
};
constexpr PartRow kParts[] = {
    {"Whole", 0, 99, L"abcde"},  {"Inside", 1, 2, L"bc"}, {"BeforeTheStart", -3, 2, L"ab"},
    {"BehindTheEnd", 9, 2, L""}, {"NoneOfIt", 2, 0, L""}, {"Negative", 2, -1, L""},
};
class StringParts : public testing::TestWithParam<PartRow> {};
TEST_P(StringParts, ClampToTheText) {
    TzString const text = L"abcde";
    EXPECT_EQ(text.mid(GetParam().start, GetParam().count), GetParam().part);
    TzString removed = text;
    removed.remove(GetParam().start, GetParam().count);
    EXPECT_EQ(removed.length() + TzString(GetParam().part).length(), text.length());
}
INSTANTIATE_TEST_SUITE_P(Forms, StringParts, testing::ValuesIn(kParts), [](auto const& row) {
    return row.param.name;
});

TEST(String, FindsAndReplaces) {
    struct Row {
        wchar_t const* text;
        wchar_t const* what;
        wchar_t const* by;
        int count;
        wchar_t const* result;
    };
    for (Row const& row : {Row{L"aaa", L"a", L"aa", 3, L"aaaaaa"},
                           {L"aaa", L"aa", L"b", 1, L"ba"},
                           {L"abc", L"", L"x", 0, L"abc"},
                           {L"abc", L"b", L"", 1, L"ac"},
                           {L"\\a\\", L"\\", L"\\\\", 2, L"\\\\a\\\\"},
                           {L"", L"a", L"b", 0, L""}}) {
        TzString text = row.text;
        EXPECT_EQ(text.replace(row.what, row.by), row.count) << row.text;
        EXPECT_EQ(text, row.result);
    }
    TzString const text = L"a|b|c";
    EXPECT_EQ(text.find(L'|', 2), 3);
    EXPECT_EQ(text.find(L'|', 99), -1);
    EXPECT_EQ(text.findLast(L'|'), 3);
    EXPECT_EQ(text.findOneOf(L"xb|"), 1);
    EXPECT_EQ(text.right(99), L"a|b|c");
    EXPECT_EQ(text.getAt(5), 0);
    EXPECT_EQ(TzString(static_cast<wchar_t const*>(nullptr)), L"");
    EXPECT_EQ(TzString(L" \t x ").trimLeft().trimRight(), L"x");
    EXPECT_EQ(TzString(L"   ").trimRight(), L"");
}

TEST(Array, IgnoresWhatLiesOutside) {
    TzArray<int> array{1, 2, 3};
    array.insertAt(3, 4);
    array.insertAt(9, 5);
    array.insertAt(-1, 5);
    array.removeAt(7);
    array.removeAt(-1);
    EXPECT_EQ(array.length(), 4);
    EXPECT_EQ(array.find(4), 3);
    EXPECT_EQ(array.find(1, 1), -1);
    array.setLogicalLength(-2);
    EXPECT_TRUE(array.isEmpty());
    array.removeLast();
    array.setLogicalLength(2);
    EXPECT_EQ(array[1], 0);
}

TEST(Array, GrowsByAtLeastItsStep) {
    TzArray<int> array(0, 8);
    EXPECT_EQ(array.append(1), 0);
    EXPECT_GE(array.physicalLength(), 8);
    // An element of the array itself may be added while the array moves.
    for (int i = 0; i < 100; ++i)
        array.append(array[0]);
    array.append(array);
    EXPECT_EQ(array.length(), 202);
    EXPECT_EQ(array.last(), 1);
}

// Its own strings go with it; the sanitizers would tell of one that is left or freed twice.
TEST(ValueRecords, ReleaseTheirLists) {
    resbuf* const kind = tzutNewRb(0);
    kind->resval.rstring = tzutNewString(L"MTEXT");
    kind->rbnext = tzutNewRb(Tzad::eResultReal);
    kind->rbnext->rbnext = tzutNewRb(Tzad::eResultEntityKind);
    kind->rbnext->rbnext->resval.rstring = tzutNewString(nullptr);
    kind->rbnext->rbnext->rbnext = tzutNewRb(Tzad::eResultString);  // without a string
    EXPECT_STREQ(kind->rbnext->rbnext->resval.rstring, L"");
    EXPECT_EQ(tzutRelRb(kind), Tzad::ePromptNormal);
    EXPECT_EQ(tzutRelRb(nullptr), Tzad::ePromptNormal);
    wchar_t* text = tzutNewString(L"x");
    tzutDelString(text);
    EXPECT_EQ(text, nullptr);
    tzutDelBuffer(text);
}

}  // namespace
