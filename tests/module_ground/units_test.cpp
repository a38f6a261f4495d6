// Lengths and angles in the drawing's units, and the limits of line spacing that are shown in them.

#include <gtest/gtest.h>

#include <cmath>

#include "module/host_calls/unit_converter.h"
#include "module/styles/line_spacing.h"
#include "module/styles/stack_defaults.h"
#include "tests/module_ground/variables_fixture.h"

namespace {

class Units : public WithVariables {};

TEST_F(Units, ComeFromTheDrawingOrFallBack) {
    give(L"LUNITS", L"4");
    give(L"LUPREC", L"1");
    give(L"AUNITS", L"3");
    give(L"AUPREC", L"2");
    double const quarter = std::acos(-1.0) / 4;
    EXPECT_EQ(CLinearUnitConverter(kLinearUnitsOfDrawing, -1).MapDoubleToUnit(15.5), L"1'-3 1/2\"");
    EXPECT_EQ(CLinearUnitConverter(kDecimal, 3).MapDoubleToUnit(15.5), L"15.500");
    EXPECT_EQ(CLinearUnitConverter(LinearUnits{0}, 2).MapDoubleToUnit(15.5), L"15.50");
    EXPECT_EQ(CLinearUnitConverter(LinearUnits{6}, 2).MapDoubleToUnit(15.5), L"15.50");
    EXPECT_EQ(CRadialUnitConverter(kRadialUnitsOfDrawing, -1).MapDoubleToUnit(quarter), L"0.79r");
    EXPECT_EQ(CRadialUnitConverter(kDegrees, 0).MapDoubleToUnit(quarter), L"45");
    EXPECT_EQ(CRadialUnitConverter(RadialUnits{9}, 4).MapDoubleToUnit(quarter), L"45d0'0\"");
}

TEST_F(Units, AreReadBackOrGiveZero) {
    CLinearUnitConverter const lengths(kDecimal, 4);
    bool ok = false;
    EXPECT_EQ(lengths.MapUnitToDouble(L"2.5", &ok), 2.5);
    EXPECT_TRUE(ok);
    EXPECT_EQ(lengths.MapUnitToDouble(L"2.5 apples", &ok), 0);
    EXPECT_FALSE(ok);
    EXPECT_EQ(lengths.MapUnitToDouble(L"", nullptr), 0);
    EXPECT_DOUBLE_EQ(CRadialUnitConverter(kDegrees, 4).MapUnitToDouble(L"180", &ok),
                     std::acos(-1.0));
    EXPECT_TRUE(ok);
}

TEST_F(Units, CutLongTexts) {
    TzString const text = CLinearUnitConverter(kDecimal, 8).MapDoubleToUnit(1e200);
    EXPECT_EQ(text.length(), 127);
}

struct FactorRow {
    char const* name;
    wchar_t const* precision;
    double height;
    double factor;
    double fixed;
    bool valid;
};
constexpr FactorRow kFactors[] = {
    {"Least", L"4", 0.2, 0.25, 0.25, true},
    {"Greatest", L"4", 0.2, 4.0, 4.0, true},
    {"Between", L"4", 0.2, 1.5, 1.5, true},
    {"TooSmall", L"4", 0.2, 0.2498, 0.2498, false},
    {"TooGreat", L"4", 0.2, 4.0001, 4.0001, false},
    // 0.25 of the distance 0.3333 is shown as 0.0833, which reads back as a factor of 0.2499.
    {"SmallByRounding", L"4", 0.2, 0.24995, 0.25, true},
    // 4 times the distance 1.6667 is shown as 6.6667, which reads back as a factor of 4.00002.
    {"GreatByRounding", L"4", 1.0, 4.00001, 4.0, true},
    {"GreatBeyondRounding", L"4", 1.0, 4.0001, 4.0001, false},
    {"EverySmallOneAtNoDecimals", L"0", 1.0, 0.001, 0.25, true},
    {"Zero", L"4", 0.2, 0.0, 0.0, false},
    {"Negative", L"0", 1.0, -0.1, -0.1, false},
};
class LineSpacingFactor : public WithVariables, public testing::WithParamInterface<FactorRow> {};
TEST_P(LineSpacingFactor, IsPulledOntoALimitThatRoundingMissed) {
    FactorRow const& row = GetParam();
    give(L"LUPREC", row.precision);
    double factor = row.factor;
    FixLineSpacingFactor(factor, row.height);
    EXPECT_EQ(factor, row.fixed);
    EXPECT_EQ(ValidateLineSpacingFactor(factor), row.valid);
}
INSTANTIATE_TEST_SUITE_P(Rows, LineSpacingFactor, testing::ValuesIn(kFactors), [](auto const& row) {
    return row.param.name;
});

TEST_F(Units, NoNumberIsNoFactor) {
    EXPECT_FALSE(ValidateLineSpacingFactor(std::nan("")));
}

TEST_F(Units, SayWithinWhatTheSpacingMustLie) {
    EXPECT_EQ(InvalidSpacingFactorMessage(3), L"1.2500|0.25|20.0000|4");
}

TEST_F(Units, LineSpacingAndStacksStandInTheirVariables) {
    EXPECT_TRUE(SetLineSpacingFactor(2.5));
    EXPECT_FALSE(SetLineSpacingFactor(5));
    EXPECT_TRUE(SetLineSpacingStyle(TzDb::kExactly));
    EXPECT_TRUE(SetDefaultStackScale(100));
    EXPECT_FALSE(SetDefaultStackScale(126));
    EXPECT_TRUE(SetDefaultStackAlignment(kAlignTop));
    EXPECT_EQ(store_.number(L"TSPACEFAC"), 2.5);
    EXPECT_EQ(store_.number(L"TSPACETYPE"), 2);
    EXPECT_EQ(store_.number(L"TSTACKSIZE"), 100);
    EXPECT_EQ(store_.number(L"TSTACKALIGN"), 2);
}

}  // namespace
