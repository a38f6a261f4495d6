// Drawing units and twips, and the pairs that are remembered.

#include <climits>
#include <cmath>

#include <gtest/gtest.h>

#include "module/markup/shared/string_stream.h"
#include "tz/mte/scale_correction.h"

namespace {

CScaleCorrection scaleOf(signed char roundToTen, int twips, double units) {
    CScaleCorrection scale(roundToTen);
    scale.SetScaleTwips(twips);
    scale.SetScaleUnits(units);
    return scale;
}

TEST(Scale, TurnsUnitsToTwips) {
    struct Row {
        int roundToTen;
        double units;
        int twips;
    };
    constexpr Row kRows[] = {
        {0, 0.2, 280},
        {0, 0.25, 350},
        {0, 1e-9, 1},  // a positive length never
                       // vanishes
        {1, 1e-9, 10},
        {1, 0.2, 280},
        {1, 0.2001, 280},  // 280.14, truncated before
                           // the rounding
        {1, 0.2008, 290},
        {0, 0.0, 0},
        {0, -1.0, -1400},
        {1, -1.0, -1390},
        {0, 1e300, INT_MAX},
        {0, -1e300, INT_MIN},
    };
    for (Row const& row : kRows) {
        CScaleCorrection scale = scaleOf(static_cast<signed char>(row.roundToTen), 280, 0.2);
        EXPECT_EQ(scale.ScaleUnitsToTwips(row.units), row.twips) << row.units;
    }
    EXPECT_EQ(scaleOf(1, 280, 0.2).ScaleUnitsToTwips(1e300), -214748364 * 10);  // wraps
    EXPECT_EQ(CScaleCorrection(0).ScaleUnitsToTwips(1.0), 1);                   // no scale: NaN
}

TEST(Scale, RemembersTheFirstLengthOfATwipsValue) {
    CScaleCorrection scale = scaleOf(0, 280, 0.2);
    double const odd = 0.1 + 0.2;
    int const twips = scale.ScaleUnitsToTwips(odd);
    EXPECT_EQ(scale.ScaleUnitsToTwips(std::nextafter(odd, 1.0)), twips);
    EXPECT_EQ(scale.ScaleTwipsToUnits(twips), odd);
    EXPECT_NE(scale.ScaleTwipsToUnits(twips), twips / (280 / 0.2));
}

TEST(Scale, RemembersOnlySixteenBits) {
    CScaleCorrection scale = scaleOf(0, 1, 1.0);
    double units = -7.0;
    for (double const length : {-1.0, 65536.0}) {
        int const twips = scale.ScaleUnitsToTwips(length);
        EXPECT_FALSE(scale.LookupUnits(twips, units));
        EXPECT_EQ(scale.ScaleTwipsToUnits(twips), length);
    }
    EXPECT_EQ(units, -7.0);
    EXPECT_EQ(scale.ScaleUnitsToTwips(65535.5), 65535);
    EXPECT_TRUE(scale.LookupUnits(65535, units));
    EXPECT_EQ(units, 65535.5);
    scale.AddScale(65536, 1.0);
    EXPECT_FALSE(scale.LookupUnits(65536, units));
}

TEST(Scale, CanBeTaughtAndRescaled) {
    CScaleCorrection scale = scaleOf(0, 280, 0.2);
    scale.AddScale(280, 0.3);
    scale.AddScale(280, 0.4);
    EXPECT_EQ(scale.ScaleTwipsToUnits(280), 0.4);
    scale.RescaleUnits(0.4);
    EXPECT_EQ(scale.ScaleTwipsToUnits(280), 0.8);
    EXPECT_EQ(scale.ScaleTwipsToUnits(700), 1.0);
    EXPECT_TRUE(std::isnan(CScaleCorrection(0).ScaleTwipsToUnits(0)));
}

TEST(Stream, IsReadWhenClosed) {
    CStringStream stream;
    stream.Append(L"ab");
    stream.Append(L'c');
    EXPECT_TRUE(stream.isOpen());
    EXPECT_STREQ(stream.Close().c_str(), L"abc");
    EXPECT_STREQ(stream.Close().c_str(), L"abc");
    EXPECT_FALSE(stream.isOpen());
    stream.Grow();
    stream.Append(L"d");
    EXPECT_STREQ(stream.Close().c_str(), L"abcd");
}

}  // namespace
