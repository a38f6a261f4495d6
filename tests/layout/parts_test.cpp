#include <gtest/gtest.h>

#include <cmath>
#include <string>

#include "host/layout/line_layout.h"
#include "tests/layout/layout_printer.h"

namespace {

using namespace tzhost;
using namespace tztest;

struct RunRow {
    char const* name;
    wchar_t const* contents;
    char const* runs;   // 'text'@X,Y,ADVANCE with *HEIGHT
    char const* rules;  // kind and X,Y-X,Y
};

// A text height is 1493 / 1233 = 1.21087 letters. Of a stack the upper baseline lies 1.6 (over),
// 0.9 (fraction), 1.4 (tolerance) heights above the lower one, and 0.1 are left free at either end
// but for an over bar, which lies at 1.3. The slash is 0.6 heights wide and shares 0.1 with each
// part.
constexpr RunRow kRunRows[] = {
    {"Over", L"a\\S1/222;b",
     "'a'@0,-2.6,1 '1'@2.12109,-1,1 '222'@1.12109,-2.6,3 'b'@4.24217,-2.6,1",
     "b1,-1.3-4.24217,-1.3"},
    {"Tolerance", L"\\S+0.1^-0.25;b",
     "'+0.1'@0.121087,-1,4 '-0.25'@0.121087,-2.4,5 'b'@5.24217,-2.4,1", ""},
    {"Fraction", L"\\S1#2;b", "'1'@0.121087,-1,1 '2'@1.60543,-1.9,1 'b'@2.72652,-1.9,1",
     "s1,-1.9-1.72652,0"},
    // Around the middle at half a height a stack of 2.6 reaches 1.8 above the baseline and 0.8
    // below.
    {"Middle", L"\\A1;\\S1/2;\\Pb", "'1'@0.121087,-1,1 '2'@0.121087,-2.6,1 'b'@0,-4.26667,1",
     "b0,-1.3-1.24217,-1.3"},
    {"Top", L"\\A2;\\S1/2;", "'1'@0.121087,-1,1 '2'@0.121087,-2.6,1", "b0,-1.3-1.24217,-1.3"},
    {"StackWithoutUpper", L"\\S^2;b", "'2'@0.121087,-2.4,1 'b'@1.24217,-2.4,1", ""},
    {"SmallStack", L"a{\\H0.5x;\\S1^2;}",
     "'a'@0,-1.2,1 '1'@1.06054,-0.5,0.5*0.5 '2'@1.06054,-1.2,0.5*0.5", ""},
    {"DefaultTabs", L"a\tb\t\tc", "'a'@0,-1,1 'b'@4.84347,-1,1 'c'@14.5304,-1,1", ""},
    {"OwnTabs", L"\\pt2466,6165;a\tb\tc\td", "'a'@0,-1,1 'b'@2,-1,1 'c'@5,-1,1 'd'@9.68694,-1,1",
     ""},
    {"TabAtItsStop", L"\\pt2466,6165;ab\tc", "'ab'@0,-1,2 'c'@5,-1,1", ""},
    {"TabToHangingIndent", L"\\pi-3699,l3699;1.\ta", "'1.'@0,-1,2 'a'@3,-1,1", ""},
    {"Underline", L"a\\Lbc\\ld", "'a'@0,-1,1 'bc'@1,-1,2 'd'@3,-1,1", "u1,-1.2-3,-1.2"},
    {"UnderlineAcrossHeights", L"\\La{\\H2x;b}c", "'a'@0,-2,1 'b'@1,-2,2*2 'c'@3,-2,1",
     "u0,-2.4-4,-2.4"},
    {"OverlineAcrossFonts", L"\\Oa{\\fDejaVu Sans Mono|b0|i0|c0|p0;b}", "'a'@0,-1,1 'b'@1,-1,1",
     "o0,0.2-2,0.2"},
    {"UnderlineByColour", L"\\La\\C1;b", "'a'@0,-1,1 'b'@1,-1,1", "u0,-1.2-1,-1.2 u1,-1.2-2,-1.2"},
    {"UnderlinedTab", L"\\pt2466;\\La\tb", "'a'@0,-1,1 'b'@2,-1,1", "u0,-1.2-3,-1.2"},
    // The H of Liberation Sans advances 1479 units and is 1409 high.
    {"FacesByTheirOwnMeasure", L"a{\\fLiberation Sans|b0|i0|c0|p0;H}b",
     "'a'@0,-1,1 'H'@1,-1,1.27102 'b'@2.27102,-1,1", ""},
    // An ideograph is one em wide, 1.66099 letters; accents stand on their letter.
    {"LatinAndIdeographs", L"ab\u4E2D\u6587c", "'ab\u4E2D\u6587c'@0,-1,6.32198", ""},
    {"AccentsTakeNoRoom", L"e\u0301\u0302x\\Le\u0301", "'e\u0301\u0302x'@0,-1,2 'e\u0301'@2,-1,1",
     "u2,-1.2-3,-1.2"},
    {"WidthAndTracking", L"\\W0.5;\\T2;ab\\Lc", "'ab'@0,-1,2 'c'@2,-1,1", "u2,-1.2-3,-1.2"},
    {"ObliqueTakesNoRoom", L"\\Q20;ab\\Oc", "'ab'@0,-1,2 'c'@2,-1,1", "o2,0.2-3,0.2"},
    {"StackInATab", L"\\pt6165;\\S1^2;\tb", "'1'@0.121087,-1,1 '2'@0.121087,-2.4,1 'b'@5,-2.4,1",
     ""},
    {"ControlsAreDropped", L"a\rb\x1F\x7F\x85", "'ab'@0,-1,2", ""},
};

TEST(Parts, StandWhereTheyAreCounted) {
    for (RunRow const& row : kRunRows) {
        MTextLayout const layout = layOutMText(monospaced(row.contents, 0));
        EXPECT_EQ(printGlyphRuns(layout), row.runs) << row.name;
        EXPECT_EQ(printRules(layout), row.rules) << row.name;
    }
}

TEST(Parts, StackPartsAreCentredUponEachOther) {
    for (double const height : {1e-6, 0.2, 1e9}) {
        MTextLayoutInput input = monospaced(L"x\\SWide/i;", 0);
        input.style.typeface = L"DejaVu Serif";
        input.textHeight = height;
        MTextLayout const layout = layOutMText(input);
        ASSERT_EQ(layout.runs.size(), 3U);
        auto const middle = [](GlyphRun const& run) { return run.x + run.advance / 2.0; };
        EXPECT_NEAR((middle(layout.runs[1]) - middle(layout.runs[2])) / height, 0.0, 1e-9);
        TextRule const& bar = layout.rules.front();
        EXPECT_NEAR(((bar.from.x + bar.to.x) / 2.0 - middle(layout.runs[1])) / height, 0.0, 1e-9);
    }
}

TEST(Parts, StackScaleSizesTheParts) {
    MTextLayoutInput input = monospaced(L"\\S1^2;", 0);
    input.stackScalePercent = 50;
    EXPECT_EQ(printGlyphRuns(layOutMText(input)),
              "'1'@0.0605434,-0.5,0.5*0.5 '2'@0.0605434,-1.2,0.5*0.5");
}

// Hebrew (DejaVu Sans Mono has none, but its face decides no order) stands from right to left,
// numbers in it from left to right; the first strong letter decides the order of the whole. A
// number after Arabic letters goes with them, so the blank after the number does too.
TEST(Parts, StandInTheOrderTheyAreSeen) {
    struct {
        wchar_t const* contents;
        char const* order;
    } const rows[] = {
        {L"ab \u05D0\u05D1 cd", "ab |\u05D0\u05D1| cd"},
        {L"\u05D0\u05D1 12 \u05D2", " \u05D2|12|\u05D0\u05D1 "},
        {L"\u05D0 ab", "ab|\u05D0 "},
        {L"ab \u0633\u0644\u0627\u0645 \u4E2D c", "ab |\u0633\u0644\u0627\u0645| \u4E2D c"},
        {L"\u0633 12 \u4E2D \u0644", " \u0644|\u4E2D| |12|\u0633 "},
    };
    for (auto const& row : rows) {
        MTextLayout const layout = layOutMText(monospaced(row.contents, 0));
        std::string order;
        double x = 0.0;
        for (GlyphRun const& run : layout.runs) {
            std::wstring const text = run.text;
            MTextLayout single;
            single.runs = {run};
            std::string const printed = printGlyphRuns(single);
            order += (order.empty() ? "" : "|") + printed.substr(1, printed.find('@') - 2);
            EXPECT_NEAR(run.x, x, 1e-6);
            x += run.advance;
        }
        EXPECT_EQ(order, row.order);
    }
}

struct ColumnRow {
    char const* name;
    LayoutColumns columns;
    double height;
    char const* lines;
    char const* box;
};

// Five lines "a" to "e", three to a column of height 1 + 2 * 5/3; columns of 4 letters, gutters
// of 2.
TEST(Columns, BreakWhereTheyAreFull) {
    double const full = kCapital * (1.0 + 2.0 * 5.0 / 3.0);
    double const two = kCapital * (1.0 + 5.0 / 3.0);
    auto const columns = [](int type, bool automatic, int count, std::vector<double> heights) {
        return LayoutColumns{type, automatic, count, 4 * kLetter, 2 * kLetter, std::move(heights)};
    };
    std::string const down = "0:0,-1,1 0:0,-2.66667,1 0:0,-4.33333,1 ";
    ColumnRow const rows[] = {
        {"Static", columns(1, false, 3, {}), full, "1:6,-1,1 1:6,-2.66667,1", "0,-4.33333-16,0"},
        {"StaticLastTakesAll", columns(1, false, 2, {}), two, nullptr, "0,-4.33333-10,0"},
        {"StaticShare", columns(1, false, 2, {}), 0.0, "1:6,-1,1 1:6,-2.66667,1",
         "0,-4.33333-10,0"},
        {"DynamicAutomatic", columns(2, true, 0, {}), full, "1:6,-1,1 1:6,-2.66667,1",
         "0,-4.33333-10,0"},
        {"DynamicWithoutHeight", columns(2, true, 0, {}), 0.0, "0:0,-6,1 0:0,-7.66667,1",
         "0,-7.66667-4,0"},
        {"DynamicOwnHeights", columns(2, false, 0, {full, kCapital, 0.0}), 0.0,
         "1:6,-1,1 2:12,-1,1", "0,-4.33333-16,0"},
        {"NarrowByRounding", columns(1, false, 3, {}), full * (1.0 - 1e-12),
         "1:6,-1,1 1:6,-2.66667,1", "0,-4.33333-16,0"},
    };
    for (ColumnRow const& row : rows) {
        MTextLayoutInput input = monospaced(L"a\\Pb\\Pc\\Pd\\Pe", 0);
        input.columns = row.columns;
        input.height = row.height;
        MTextLayout const layout = layOutMText(input);
        if (row.lines != nullptr) {
            EXPECT_EQ(printLines(layout), down + row.lines) << row.name;
        }
        EXPECT_EQ(printBox(layout.box), row.box) << row.name;
    }
}

// Words of 3 wrap at columns of 7 letters, two to a line and two lines to a column; gutters of 2.
TEST(Columns, WrapAtTheirOwnWidth) {
    struct {
        int type, attachment;
        char const* lines;
        char const* box;
    } const rows[] = {
        {1, 1, "0:0,-1,7 0:0,-2.66667,7 1:9,-1,7 1:9,-2.66667,3", "0,-2.66667-25,0"},
        {2, 1, "0:0,-1,7 0:0,-2.66667,7 1:9,-1,7 1:9,-2.66667,3", "0,-2.66667-16,0"},
        {2, 3, "0:-16,-1,7 0:-16,-2.66667,7 1:-7,-1,7 1:-3,-2.66667,3", "-16,-2.66667-0,0"},
    };
    for (auto const& row : rows) {
        MTextLayoutInput input = monospaced(L"aaa bbb ccc ddd eee fff ggg", 100);
        input.columns = {row.type, true, 3, 7 * kLetter, 2 * kLetter, {}};
        input.height = kCapital * (1.0 + 5.0 / 3.0);
        input.attachment = row.attachment;
        MTextLayout const layout = layOutMText(input);
        EXPECT_EQ(printLines(layout), row.lines) << row.type << row.attachment;
        EXPECT_EQ(printBox(layout.box), row.box) << row.type << row.attachment;
    }
}

// A text height is 1.21087 letters; half of it is added on all sides at 1.5, four at 5.
TEST(Background, IsWiderThanTheTextByItsScale) {
    struct {
        double scale;
        char const* box;
    } const rows[] = {
        {1.0, "0,-2.66667-4,0"},
        {1.5, "-0.605434,-3.16667-4.60543,0.5"},
        {5.0, "-4.84347,-6.66667-8.84347,4"},
    };
    MTextLayout const layout = layOutMText(monospaced(L"aaaa\\Pbb", 6));
    for (auto const& row : rows)
        EXPECT_EQ(printBox(backgroundBox(layout, kCapital, row.scale)), row.box) << row.scale;
}

TEST(Columns, TakeALineHigherThanThemselves) {
    MTextLayoutInput input = monospaced(L"{\\H9x;a}\\Pb\\Pc", 0);
    input.columns = {2, true, 0, 4 * kLetter, 0.0, {}};
    input.height = kCapital * 3.0;
    EXPECT_EQ(printLines(layOutMText(input)), "0:0,-9,9 1:4,-1,1 1:4,-2.66667,1");
}

// The stack under the second line's baseline reaches 0.8 heights down, beyond the column's foot.
TEST(Columns, HoldWhatHangsBelowTheLine) {
    MTextLayoutInput input = monospaced(L"a\\P\\A1;\\S1/2;", 0);
    input.columns = {2, true, 0, 4 * kLetter, 0.0, {}};
    input.height = kCapital * (1.0 + 5.0 / 3.0 + 0.8 + 0.79);
    EXPECT_EQ(layOutMText(input).lines.back().column, 1);
    input.height = kCapital * (1.0 + 5.0 / 3.0 + 0.8 + 0.81);
    EXPECT_EQ(layOutMText(input).lines.back().column, 0);
}

// Letters stand 3/2 heights apart, each in the middle of its step; lines go to the left, 5/3 apart.
TEST(Vertical, LinesGoDownAndToTheLeft) {
    MTextLayoutInput input = monospaced(L"ab\\Pc", 0);
    input.style.typeface = L"@DejaVu Sans Mono";
    MTextLayout const layout = layOutMText(input);
    double const across = (1.0 + 5.0 / 3.0) * kCapital;
    EXPECT_NEAR(layout.width, across, 1e-6);
    EXPECT_NEAR(layout.height, 2.0 * 1.5 * kCapital, 1e-6);
    ASSERT_EQ(layout.runs.size(), 3U);
    EXPECT_NEAR(layout.runs[0].x, -kCapital / 2.0 - kLetter / 2.0, 1e-6);
    EXPECT_NEAR(layout.runs[0].y, -(1.0 + 0.25) * kCapital, 1e-6);
    EXPECT_NEAR(layout.runs[1].y, -(1.0 + 0.25 + 1.5) * kCapital, 1e-6);
    EXPECT_NEAR(layout.runs[2].x, kCapital / 2.0 - kLetter / 2.0 - across, 1e-6);
    EXPECT_NEAR(layout.runs[2].y, layout.runs[0].y, 1e-6);
}

struct VerticalAttachmentRow {
    int attachment;
    bool flag;  // else by the typeface
    char const* box;
};

// One column "ab" of 1 text height across (1.21087 letters) and 2 steps of 3/2 down. The typeface's
// frame is turned by 270 degrees: its left is the page's top, its top the page's right. "@" at
// TL used to stand to the right of the corner that a drag had given.
constexpr VerticalAttachmentRow kVerticalAttachments[] = {
    {1, true, "0,-3-1.21087,0"},
    {3, true, "-1.21087,-3-0,0"},
    {5, true, "-0.605434,-1.5-0.605434,1.5"},
    {7, true, "0,0-1.21087,3"},
    {1, false, "-1.21087,-3-0,0"},
    {3, false, "-1.21087,0-0,3"},
    {5, false, "-0.605434,-1.5-0.605434,1.5"},
    {7, false, "0,-3-1.21087,0"},
    {8, false, "0,-1.5-1.21087,1.5"},
    {9, false, "0,0-1.21087,3"},
};

TEST(Vertical, AttachmentCountsInTheFrameOfThePreview) {
    for (VerticalAttachmentRow const& row : kVerticalAttachments) {
        MTextLayoutInput input = monospaced(L"ab", 0);
        input.attachment = row.attachment;
        input.style.vertical = row.flag;
        if (!row.flag) input.style.typeface = L"@DejaVu Sans Mono";
        MTextLayout const layout = layOutMText(input);
        EXPECT_EQ(printBox(layout.box), row.box) << row.attachment << " " << row.flag;
        ASSERT_EQ(layout.runs.size(), 2U);
        EXPECT_NEAR(layout.runs[0].y + kCapital * 1.25, layout.box.top, 1e-6);
        EXPECT_NEAR(layout.runs[0].x + kLetter / 2.0, (layout.box.left + layout.box.right) / 2.0,
                    1e-6);
    }
}

struct SingleRow {
    char const* name;
    bool vertical, backward, upsideDown;
    char const* box;
};

constexpr SingleRow kSingleRows[] = {
    {"Plain", false, false, false, "0,0-3,1"},
    {"Backward", false, true, false, "-3,0-0,1"},
    {"UpsideDown", false, false, true, "0,-1-3,0"},
    {"Vertical", true, false, false, "-0.5,-4-0.5,0"},
};

TEST(SingleLine, BoxFollowsTheStyle) {
    for (SingleRow const& row : kSingleRows) {
        LineLayoutInput input;
        input.text = L"abc";
        input.textHeight = kCapital;
        input.style.typeface = L"DejaVu Sans Mono";
        input.style.vertical = row.vertical;
        input.style.backward = row.backward;
        input.style.upsideDown = row.upsideDown;
        EXPECT_EQ(printBox(layOutLine(input).box), row.box) << row.name;
    }
}

TEST(SingleLine, KnowsCharactersByCodeAndNoOtherMarkup) {
    struct {
        wchar_t const* text;
        wchar_t const* decoded;
    } const rows[] = {
        {L"\\U+00E9\\u+0041\\LB\\P{}", L"\u00E9A\\LB\\P{}"},
        {L"\\M+182A0", L"\u3042"},
        {L"\\U+00G0\\U\\M+9x\\", L"\\U+00G0\\U\\M+9x\\"},
    };
    for (auto const& row : rows) {
        EXPECT_EQ(decodeLineText(row.text), row.decoded);
    }
}

}  // namespace
