// The palette and the kinds of colour.

#include <gtest/gtest.h>

#include "tz/gi/color.h"

namespace {

struct PaletteRow {
    int index;
    unsigned int rgb;  // 0x00BBGGRR
};
constexpr PaletteRow kPaletteRows[] = {
    {-1, 0},         {0, 0},          {1, 0x0000FF},  {7, 0xFFFFFF},   {8, 0x808080},
    {11, 0x7F7FFF},  {12, 0x0000CC},  {20, 0x003FFF}, {180, 0xFF003F}, {249, 0x2F264C},
    {250, 0x282828}, {255, 0xF0F0F0}, {256, 0},
};
TEST(Palette, HoldsTheHostsColours) {
    for (PaletteRow const& row : kPaletteRows) {
        EXPECT_EQ(tzedGetRGB(row.index), row.rgb) << "index " << row.index;
    }
}

struct NearestRow {
    unsigned char red, green, blue;
    int index;
};
constexpr NearestRow kNearestRows[] = {
    {255, 0, 0, 1},                      // 10 is the same red
    {254, 1, 1, 1},     {0, 0, 0, 250},  // grey 40 is nearer than the darkest red
    {255, 255, 255, 7}, {128, 128, 128, 8}, {127, 127, 255, 171}, {41, 41, 41, 250},
};
TEST(Palette, FindsTheLowestNearestIndex) {
    for (int pass = 0; pass < 2; ++pass) {  // the second time from memory
        for (NearestRow const& row : kNearestRows) {
            EXPECT_EQ(TzCmEntityColor(row.red, row.green, row.blue).colorIndex(), row.index)
                << int{row.red} << ',' << int{row.green} << ',' << int{row.blue};
        }
    }
}

TEST(EntityColor, KeepsItsKind) {
    TzCmEntityColor color;
    EXPECT_EQ(color.colorIndex(), 256);
    EXPECT_EQ(color.setColorIndex(30), Tzad::eOk);
    EXPECT_EQ(color.getCOLORREF(), 0x007FFFU);
    EXPECT_EQ(color.setColorIndex(257), Tzad::eOutOfRange);
    EXPECT_EQ(color.colorIndex(), 30);
    EXPECT_NE(color, TzCmEntityColor(255, 127, 0));
    color.setRGB(255, 127, 0);
    EXPECT_EQ(color, TzCmEntityColor(255, 127, 0));
    EXPECT_EQ(color.colorMethod(), 194);
    EXPECT_EQ(color.colorIndex(), 30);
    EXPECT_EQ(TzCmEntityColor::fromIndex(0).colorIndex(), 0);
    EXPECT_TRUE(TzCmEntityColor::fromIndex(-5).isByLayer());
}

TEST(Transparency, StaysWithinItsLimits) {
    TzCmTransparency transparency;
    EXPECT_EQ(transparency.setPercent(90), Tzad::eOk);
    EXPECT_EQ(transparency.setPercent(91), Tzad::eOutOfRange);
    EXPECT_EQ(transparency.setPercent(-1), Tzad::eOutOfRange);
    EXPECT_EQ(transparency.percent(), 90);
    EXPECT_EQ(transparency.alpha(), 26);
}

}  // namespace
