// Malformed and oversized texts: each is read to its end, in time linear in its length, without the
// call stack. The sizes are such that a look-ahead that begins anew each time would not end here.

#include <string>

#include <gtest/gtest.h>

#include "module/markup/read_markup/stack_look_ahead.h"
#include "tests/markup/conversions.h"

namespace {

using markuptest::kRowName;
using markuptest::Session;

struct HostileCase {
    char const* name;
    wchar_t const* head;
    wchar_t const* unit;
    int count;
    int growth;  // characters of the result for one of the input, at most
};

std::wstring textOf(HostileCase const& row) {
    std::wstring text = row.head;
    std::wstring const unit = row.unit;
    text.reserve(text.size() + unit.size() * static_cast<std::size_t>(row.count));
    for (int i = 0; i < row.count; ++i)
        text += unit;
    return text;
}

constexpr HostileCase kRtf[] = {
    {"OpenGroups", L"", L"{", 1000000, 1},
    {"OpenGroupsInHeader", L"{\\rtf1 ", L"{", 1000000, 1},
    {"OpenGroupsInFonts", L"{\\fonttbl", L"{", 300000, 1},
    {"OpenGroupsInAFont", L"{\\fonttbl{\\f1", L"{\\fname", 100000, 1},
    {"OpenGroupsInColors", L"{\\colortbl", L"{", 300000, 1},
    {"OpenGroupsInLists", L"{\\pntext", L"{", 300000, 1},
    {"OpenGroupsWithLook", L"", L"{\\b a", 100000, 40},
    {"Closings", L"{\\rtf1 a", L"}", 300000, 1},
    {"FontTables", L"", L"{\\fonttbl", 200000, 1},
    {"StrayInFonts", L"{\\fonttbl", L"\\x y;", 200000, 1},
    {"FontsOfOneNumber", L"{\\fonttbl", L"{\\f1 A;}", 100000, 1},
    {"NamesWithoutEnd", L"{\\fonttbl", L"{\\f1 A", 100000, 1},
    {"Colors", L"{\\colortbl", L"\\red1;", 500000, 1},
    {"StrayInColors", L"{\\colortbl", L"\\x y;{z}", 200000, 1},
    {"Paragraphs", L"", L"\\pard", 200000, 1},
    {"ParagraphsWithIndents", L"", L"\\pard\\li5", 100000, 1},
    {"ParagraphsWithOneTab", L"", L"\\pard\\tx50", 100000, 1},
    {"ParagraphsWithTabs", L"", L"\\pard\\tx1\\tx2\\tx3", 50000, 1},
    {"Lists", L"", L"\\pntext", 200000, 1},
    {"StacksWithoutEnd", L"", L"\\\\S", 200000, 2},
    {"Destinations", L"", L"{\\*\\x", 200000, 1},
    {"Toggles", L"", L"\\ul a\\ul0 b", 100000, 1},
    {"LoneBackslashes", L"", L"\\", 300001, 2},
    {"CutOffEscapes", L"", L"\\'", 200000, 1},
    {"CutOffCodes", L"", L"\\u", 200000, 5},
    {"LongNumbers", L"", L"\\fs99999999999999999999 a", 50000, 2},
    {"BinaryWithoutData", L"{\\rtf1 a", L"\\bin2000000000 ", 50000, 1},
    {"LongWord", L"\\", L"a", 1000000, 1},
    {"OneLetter", L"", L"a", 1000000, 1},
};

class HostileRtf : public testing::TestWithParam<HostileCase> {};
TEST_P(HostileRtf, IsReadToItsEnd) {
    Session session;
    std::wstring const text = textOf(GetParam());
    std::size_t const most = text.size() * static_cast<std::size_t>(GetParam().growth) + 100;
    EXPECT_LE(session.toMtext(text).size(), most);
}

constexpr HostileCase kMarkup[] = {
    {"OpenGroups", L"", L"{", 1000000, 1},
    {"Closings", L"", L"}", 300000, 1},
    {"GroupsWithFont", L"\\fA|;", L"{}", 200000, 1},
    {"Stacks", L"", L"\\S", 200000, 2},
    {"StacksWithLetters", L"", L"\\Sab", 100000, 2},
    {"StacksWithCodes", L"", L"\\S\\u+/000", 50000, 2},
    {"StacksAligned", L"", L"\\S\\\\", 100000, 2},
    {"StackSignAtTheEnd", L"/", L"\\S", 100001, 2},
    {"Fonts", L"", L"\\fA", 50000, 8},
    {"FontsWithoutEnd", L"", L"\\fA|b", 50000, 8},
    {"Files", L"", L"\\Fa;", 50000, 8},
    {"Tabs", L"\\pt", L"1,", 200000, 1},
    {"Settings", L"", L"\\pt1;\\ptz;", 50000, 6},
    {"Heights", L"", L"\\H2x;", 100000, 5},
    {"LongNumbers", L"", L"\\C99999999999999999999;", 50000, 1},
    {"Codes", L"", L"\\U", 200000, 3},
    {"LoneBackslashes", L"", L"\\", 300001, 1},
    {"Wide", L"", L"\u4E2D", 200000, 8},
    {"OneLetter", L"", L"a", 1000000, 1},
};

class HostileMarkup : public testing::TestWithParam<HostileCase> {};
TEST_P(HostileMarkup, IsReadToItsEnd) {
    Session session;
    std::wstring const text = textOf(GetParam());
    std::size_t const most = text.size() * static_cast<std::size_t>(GetParam().growth) + 300;
    EXPECT_LE(session.toRtf(text).size(), most);
}

INSTANTIATE_TEST_SUITE_P(Texts, HostileRtf, testing::ValuesIn(kRtf), kRowName);
INSTANTIATE_TEST_SUITE_P(Texts, HostileMarkup, testing::ValuesIn(kMarkup), kRowName);

// Each toggle compares and keeps names, whose length must not count.
TEST(LongNames, CostOnceEach) {
    Session session;
    std::wstring rtf = L"{\\fonttbl{\\f1 " + std::wstring(20000, L'n') + L";}{\\f2 " +
                       std::wstring(20000, L'N') + L";}}";
    for (int i = 0; i < 50000; ++i)
        rtf += L"\\f1\\ul a\\f2\\ul0 b";
    EXPECT_LE(session.toMtext(rtf).size(), 50000U * 8 + 30000);
}

TEST(ManyFonts, AreFoundByNumber) {
    Session session;
    std::wstring rtf = L"{\\fonttbl";
    for (int i = 0; i < 300000; ++i)
        rtf += L"{\\f" + std::to_wstring(2000000000 + i) + L" F" + std::to_wstring(i) + L";}";
    rtf += L"}\\f2000299999 a";
    EXPECT_STREQ(session.toMtext(rtf).c_str(), L"{\\fF299999|b0|i0|c0|p0;a}");
}

// Asked often, the look-ahead works out all places in one pass. A search from each place must find
// the same.
TEST(StackLookAhead, AnswersTheSameWhenPressed) {
    std::wstring const alphabet = L"\\;u/ab";
    unsigned int seed = 1;
    for (int round = 0; round < 20; ++round) {
        std::wstring text;
        for (int i = 0; i < 3000; ++i) {
            seed = seed * 1103515245U + 12345U;
            unsigned int const pick = (seed >> 16) % 40;
            text += pick < 12 ? alphabet[pick % 6] : L"\\ab"[pick % 3];
        }
        StackLookAhead pressed(text.c_str());
        for (int again = 0; again < 200; ++again) {
            for (std::size_t at = 0; at < text.size(); at += 97)
                (void)pressed.isStack(text.c_str() + at);
        }
        for (std::size_t at = 0; at < text.size(); ++at) {
            StackLookAhead fresh(text.c_str());
            ASSERT_EQ(pressed.isStack(text.c_str() + at), fresh.isStack(text.c_str() + at))
                << round << " " << at;
        }
    }
}

}  // namespace
