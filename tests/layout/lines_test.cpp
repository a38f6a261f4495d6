#include <gtest/gtest.h>

#include <string>

#include "tests/layout/layout_printer.h"

namespace {

using namespace tzhost;
using namespace tztest;

struct LineRow {
    char const* name;
    wchar_t const* contents;
    double letters;
    char const* lines;
};

// Lines as COLUMN:X,BASELINE,ADVANCE; baselines lie 5/3 apart.
constexpr LineRow kLineRows[] = {
    {"One", L"abc", 0, "0:0,-1,3"},
    {"Paragraphs", L"abc\\Pde", 0, "0:0,-1,3 0:0,-2.66667,2"},
    {"LineFeed", L"abc\nde", 0, "0:0,-1,3 0:0,-2.66667,2"},
    {"Empty", L"", 0, "0:0,-1,0"},
    {"EmptyBetween", L"a\\P\\Pb", 0, "0:0,-1,1 0:0,-2.66667,0 0:0,-4.33333,1"},
    {"Wrap", L"aaa bbb ccc", 7, "0:0,-1,7 0:0,-2.66667,3"},
    {"WrapHangsBlanks", L"aaa    bbb", 4, "0:0,-1,3 0:0,-2.66667,3"},
    {"BlanksAtTheEndCount", L"aaa  ", 0, "0:0,-1,5"},
    {"LongWordStaysWhole", L"a bbbbbbbbbb c", 4, "0:0,-1,1 0:0,-2.66667,10 0:0,-4.33333,1"},
    {"HardSpaceHolds", L"a b\\~c", 3, "0:0,-1,1 0:0,-2.66667,3"},
    {"Hyphen", L"aaa-bbb", 5, "0:0,-1,4 0:0,-2.66667,3"},
    // An ideograph is one em wide, 1.66099 letters, and a comma never opens a line.
    {"Ideographs", L"\u4E2D\u6587\u5B57\uFF0C\u7B26", 5.2, "0:0,-1,3.32198 0:0,-2.66667,4.98297"},
    {"LargerLineNeedsMore", L"a\\P\\H2x;b", 0, "0:0,-1,1 0:0,-4.33333,2"},
    {"LargerFirstLine", L"{\\H2x;a}\\Pb", 0, "0:0,-2,2 0:0,-3.66667,1"},
    {"LargestOnLineCounts", L"a{\\H3x;b}\\Pc", 0, "0:0,-3,4 0:0,-4.66667,1"},
    {"FirstIndent", L"\\pi2466;aaaa bbb ccc", 6, "0:2,-1,4 0:0,-2.66667,3 0:0,-4.33333,3"},
    {"HangingIndent", L"\\pi-2466,l3699;a bb cc", 6, "0:1,-1,4 0:3,-2.66667,2"},
    {"LineFeedKeepsLeftIndent", L"\\pi-1233,l1233;a\nb\\Pc", 0,
     "0:0,-1,1 0:1,-2.66667,1 0:0,-4.33333,1"},
    {"EachParagraphItsIndent", L"\\pl1233;a\\P\\pl2466;b", 0, "0:1,-1,1 0:2,-2.66667,1"},
    {"IndentNeverLeavesTheEdge", L"\\pi-2466;a", 0, "0:0,-1,1"},
};

TEST(Lines, StandWhereTheyAreCounted) {
    for (LineRow const& row : kLineRows) {
        EXPECT_EQ(printLines(layOutMText(monospaced(row.contents, row.letters))), row.lines)
            << row.name;
    }
}

struct SpacingRow {
    char const* name;
    int style;
    double factor;
    char const* lines;
};

constexpr SpacingRow kSpacings[] = {
    {"AtLeast", 1, 1.0, "0:0,-1,1 0:0,-4.33333,2 0:0,-6,1"},
    {"AtLeastWide", 1, 1.5, "0:0,-1,1 0:0,-6,2 0:0,-8.5,1"},
    {"Exactly", 2, 1.0, "0:0,-1,1 0:0,-2.66667,2 0:0,-4.33333,1"},
    {"ExactlyNarrow", 2, 0.6, "0:0,-1,1 0:0,-2,2 0:0,-3,1"},
};

TEST(Lines, SpacingFollowsStyleAndFactor) {
    for (SpacingRow const& row : kSpacings) {
        MTextLayoutInput input = monospaced(L"a\\P{\\H2x;b}\\Pc", 0);
        input.lineSpacingStyle = row.style;
        input.lineSpacingFactor = row.factor;
        EXPECT_EQ(printLines(layOutMText(input)), row.lines) << row.name;
    }
}

struct AttachmentRow {
    int attachment;
    char const* box;
    char const* lines;
};

// "aaaa" above "bb": 4 letters wide, 1 + 5/3 heights high.
constexpr AttachmentRow kAttachments[] = {
    {1, "0,-2.66667-4,0", "0:0,-1,4 0:0,-2.66667,2"},
    {2, "-2,-2.66667-2,0", "0:-2,-1,4 0:-1,-2.66667,2"},
    {3, "-4,-2.66667-0,0", "0:-4,-1,4 0:-2,-2.66667,2"},
    {4, "0,-1.33333-4,1.33333", "0:0,0.333333,4 0:0,-1.33333,2"},
    {5, "-2,-1.33333-2,1.33333", "0:-2,0.333333,4 0:-1,-1.33333,2"},
    {6, "-4,-1.33333-0,1.33333", "0:-4,0.333333,4 0:-2,-1.33333,2"},
    {7, "0,0-4,2.66667", "0:0,1.66667,4 0:0,0,2"},
    {8, "-2,0-2,2.66667", "0:-2,1.66667,4 0:-1,0,2"},
    {9, "-4,0-0,2.66667", "0:-4,1.66667,4 0:-2,0,2"},
};

TEST(Lines, AttachmentPlacesBoxAndLines) {
    for (AttachmentRow const& row : kAttachments) {
        for (double const letters : {0.0, 6.0}) {
            MTextLayoutInput input = monospaced(L"aaaa\\Pbb", letters);
            input.attachment = row.attachment;
            MTextLayout const layout = layOutMText(input);
            EXPECT_EQ(printBox(layout.box), row.box) << row.attachment << " " << letters;
            EXPECT_EQ(printLines(layout), row.lines) << row.attachment << " " << letters;
        }
    }
}

}  // namespace
