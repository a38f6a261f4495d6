// The palette and the kinds of colour.

#include <gtest/gtest.h>

#include "tz/gi/color.h"

namespace {

struct PaletteRow {
    int index;
    unsigned int rgb;  // 0x00BBGGRR
};
constexpr PaletteRow kPaletteRows[] = {
    {-1, 0},         {0, 0},          {1, 0x0000FF},   {2, 0x00FFFF},   {3, 0x00FF00},
    {4, 0xFFFF00},   {5, 0xFF0000},   {6, 0xFF00FF},   {7, 0xFFFFFF},   {8, 0x808080},
    {9, 0xC0C0C0},   {10, 0x0000FF},  {11, 0x7F7FFF},  {12, 0x0000CC},  {13, 0x6666CC},
    {16, 0x000072},  {18, 0x00004C},  {19, 0x26264C},  {20, 0x003FFF},  {30, 0x007FFF},
    {40, 0x00BFFF},  {50, 0x00FFFF},  {60, 0x00FFBF},  {90, 0x00FF00},  {110, 0x7FFF00},
    {130, 0xFFFF00}, {140, 0xFFBF00}, {170, 0xFF0000}, {180, 0xFF003F}, {210, 0xFF00FF},
    {240, 0x3F00FF}, {241, 0x9F7FFF}, {249, 0x2F264C}, {250, 0x282828}, {255, 0xF0F0F0},
    {256, 0},
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
