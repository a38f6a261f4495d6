// The arithmetic of pages: where a drawing lies on its paper, and what is left out.

#include "host/page/page_plan.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <string>

#include "host/page/page_text.h"

namespace {

using namespace tzhost;

struct PlanRow {
    char const* name;
    char const* paper;
    bool landscape;
    double margin;
    char const* scale;  // "" fits
    char const* unit;
    char const* window;  // "" for none
    PageBox extents;
    char const* expected;  // sheet, millimetres in a unit, middle, what is shown, "cut"
};
constexpr PlanRow kPlans[] = {
    {"NamedLies",
     "a3",
     true,
     10,
     "",
     "mm",
     "",
     {0, 0, 200, 100},
     "420x297 2 100,50 0,-19.25,200,119.25"},
    {"NamedStands",
     "Letter",
     false,
     0,
     "",
     "mm",
     "",
     {0, 0, 215.9, 1},
     "215.9x279.4 1 107.95,0.5 0,-139.2,215.9,140.2"},
    {"CustomAsItStands",
     "100x300",
     true,
     10,
     "",
     "mm",
     "",
     {0, 0, 40, 40},
     "100x300 2 20,20 0,-50,40,90"},
    {"Scale",
     "A3",
     true,
     10,
     "1:50",
     "mm",
     "",
     {0, 0, 20000, 10000},
     "420x297 0.02 10000,5000 0,-1925,20000,11925"},
    {"ScaleOfMetres",
     "A4",
     true,
     10,
     "1:50",
     "m",
     "",
     {0, 0, 1, 1},
     "297x210 20 0.5,0.5 -6.425,-4.25,7.425,5.25"},
    {"ScaleCuts",
     "A4",
     true,
     10,
     "1:1",
     "cm",
     "",
     {0, 0, 40, 10},
     "297x210 10 20,5 6.15,-4.5,33.85,14.5 cut"},
    {"WindowCuts",
     "120x120",
     true,
     10,
     "",
     "mm",
     "5,5,0,0",
     {0, 0, 10, 4},
     "120x120 20 2.5,2.5 0,0,5,5 cut"},
    {"WindowOfAll",
     "120x120",
     true,
     10,
     "1:2",
     "mm",
     "-9,-9,9,9",
     {0, 0, 4, 4},
     "120x120 0.5 0,0 -9,-9,9,9"},
    {"PointHasNoSize",
     "A4",
     true,
     10,
     "",
     "mm",
     "",
     {3, 4, 3, 4},
     "297x210 1 3,4 -135.5,-91,141.5,99"},
    {"FarApart",
     "A4",
     true,
     10,
     "",
     "mm",
     "",
     {-1e308, 0, 1e308, 1},
     "297x210 1 0,0.5 -138.5,-94.5,138.5,95.5 cut"},
};

std::string shown(char const* format, auto... values) {
    char text[200];
    (void)std::snprintf(text, sizeof text, format, values...);
    return text;
}

class Plans : public testing::TestWithParam<PlanRow> {};
TEST_P(Plans, LieOnTheirPaper) {
    auto const& row = GetParam();
    Page page;
    page.paper = *readPaper(row.paper);
    page.landscape = row.landscape;
    page.margin = row.margin;
    page.scale = readScale(row.scale);
    page.unit = *readUnit(row.unit);
    page.window = readWindow(row.window);
    EXPECT_EQ(problemOf(page), std::nullopt);
    PagePlan const plan = planOf(page, page.window, row.extents);
    auto const [width, height] = sheetOf(page);
    PageBox const& part = plan.shown;
    EXPECT_EQ(shown("%gx%g %g %g,%g %g,%g,%g,%g%s", width, height, plan.scale, plan.middleX,
                    plan.middleY, part.left, part.bottom, part.right, part.top,
                    plan.leavesOut ? " cut" : ""),
              row.expected);
}
INSTANTIATE_TEST_SUITE_P(Rows, Plans, testing::ValuesIn(kPlans), [](auto const& row) {
    return row.param.name;
});

TEST(Pages, StandUnderTheirOptions) {
    EXPECT_EQ(pageOf(std::nullopt, {}), std::nullopt);
    Page own;
    own.scale = makeScale(1, 50);
    own.landscape = false;
    PageChoice choice;
    choice.paper = readPaper("A2");
    choice.scale = std::optional<PageScale>();
    Page expected = own;
    expected.paper = *readPaper("a2");
    expected.scale = std::nullopt;
    EXPECT_EQ(pageOf(own, choice), expected);
    choice = {};
    choice.paper = readPaper("300x200");
    choice.landscape = false;
    EXPECT_EQ(nameOf(pageOf(own, choice)->paper), "200x300");
    Page tight;
    tight.margin = 105;
    EXPECT_NE(problemOf(tight), std::nullopt);
}

}  // namespace
