// Lengths and angles as text and back, in every unit.

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <numbers>

#include "tz/ed/units.h"
#include "tz/rx/status.h"

namespace {

constexpr double kPi = std::numbers::pi;

struct WrittenRow {
    char const* name;
    double value;
    int unit;
    int precision;
    wchar_t const* text;
};

constexpr WrittenRow kLengths[] = {
    {"Scientific", 15.5, 1, 4, L"1.5500E+01"},
    {"ScientificSmall", -1.5e-300, 1, 2, L"-1.50E-300"},
    {"ScientificZero", 0, 1, 1, L"0.0E+00"},
    {"Decimal", 15.5, 2, 4, L"15.5000"},
    {"DecimalNegative", -0.125, 2, 3, L"-0.125"},
    {"DecimalWhole", 2.5, 2, 0, L"2"},
    {"NoMinusZero", -0.00001, 2, 4, L"0.0000"},
    {"FeetDecimals", 15.5, 3, 4, L"1'-3.5000\""},
    {"FeetDecimalsCarry", 11.99999, 3, 4, L"1'-0.0000\""},
    {"InchesAlone", 3.5, 3, 2, L"3.50\""},
    {"FeetOfALargeNumber", 12e20, 3, 1, L"100000000000000000000'-0.0\""},
    {"FeetFractions", 15.5, 4, 4, L"1'-3 1/2\""},
    {"FeetNoInches", 12.5, 4, 1, L"1'-0 1/2\""},
    {"FeetExact", -24, 4, 4, L"-2'-0\""},
    {"FractionOfAnInch", 0.1875, 4, 4, L"3/16\""},
    {"CoarseFraction", 0.1875, 4, 2, L"1/4\""},
    {"NoInch", 0, 4, 4, L"0\""},
    {"Fractions", 15.5, 5, 4, L"15 1/2"},
    {"FractionsReduce", -0.75, 5, 8, L"-3/4"},
    {"FractionsCarry", 1.999, 5, 4, L"2"},
    {"FractionsHuge", 1e18, 5, 8, L"1000000000000000000"},
    {"PrecisionAbove", 1.5, 2, 99, L"1.50000000"},
    {"PrecisionBelow", 1.75, 2, -1, L"2"},
};

constexpr WrittenRow kAngles[] = {
    {"Degrees", kPi / 4, 0, 4, L"45.0000"},
    {"DegreesNegative", -kPi / 4, 0, 0, L"315"},
    {"DegreesFullCircle", 2 * kPi - 1e-9, 0, 4, L"0.0000"},
    {"DegreesManyTurns", 9 * kPi, 0, 1, L"180.0"},
    {"MinutesDegreesOnly", kPi / 4, 1, 0, L"45d"},
    {"Minutes", kPi / 8, 1, 1, L"22d30'"},
    {"Seconds", kPi / 4, 1, 4, L"45d0'0\""},
    {"SecondsToo", kPi / 4, 1, 3, L"45d0'0\""},
    {"SecondDecimal", kPi / 7, 1, 5, L"25d42'51.4\""},
    {"SecondDecimals", kPi / 7, 1, 8, L"25d42'51.4286\""},
    {"MinutesCarry", kPi / 4 - 1e-9, 1, 2, L"45d0'"},
    {"MinutesFullCircle", 2 * kPi - 1e-9, 1, 4, L"0d0'0\""},
    {"Grads", kPi / 4, 2, 4, L"50.0000g"},
    {"Radians", kPi / 4, 3, 4, L"0.7854r"},
    {"Surveyor", kPi / 4, 4, 4, L"N 45d0'0\" E"},
    {"SurveyorNorthWest", 2.0, 4, 2, L"N 24d35' W"},
    {"SurveyorSouthWest", 4.0, 4, 0, L"S 41d W"},
    {"SurveyorSouthEast", 5.5, 4, 4, L"S 45d7'36\" E"},
    {"SurveyorEast", 0, 4, 4, L"E"},
    {"SurveyorAlmostNorth", kPi / 2 - 1e-9, 4, 4, L"N"},
    {"SurveyorWest", kPi, 4, 0, L"W"},
    {"SurveyorSouth", -kPi / 2, 4, 2, L"S"},
};

using Writer = int (*)(double, int, int, TzString&);
using Reader = int (*)(wchar_t const*, int, double*);

void expectWritten(Writer write, WrittenRow const& row) {
    TzString text;
    EXPECT_EQ(write(row.value, row.unit, row.precision, text), Tzad::ePromptNormal);
    EXPECT_EQ(text.str(), row.text);
}

class Lengths : public testing::TestWithParam<WrittenRow> {};
TEST_P(Lengths, AreWrittenAs) {
    expectWritten(tzdbRToS, GetParam());
}
INSTANTIATE_TEST_SUITE_P(Units, Lengths, testing::ValuesIn(kLengths), [](auto const& row) {
    return row.param.name;
});

class Angles : public testing::TestWithParam<WrittenRow> {};
TEST_P(Angles, AreWrittenAs) {
    expectWritten(tzdbAngToS, GetParam());
}
INSTANTIATE_TEST_SUITE_P(Units, Angles, testing::ValuesIn(kAngles), [](auto const& row) {
    return row.param.name;
});

TEST(Units, RefuseWhatIsNoUnitOrNoNumber) {
    TzString text(L"kept");
    double value = 7;
    double const infinite = std::numeric_limits<double>::infinity();
    EXPECT_EQ(tzdbRToS(1, 0, 4, text), Tzad::ePromptError);
    EXPECT_EQ(tzdbRToS(1, 6, 4, text), Tzad::ePromptError);
    EXPECT_EQ(tzdbRToS(infinite, 2, 4, text), Tzad::ePromptError);
    EXPECT_EQ(tzdbAngToS(1, 5, 4, text), Tzad::ePromptError);
    EXPECT_EQ(tzdbAngToS(infinite, 0, 4, text), Tzad::ePromptError);
    EXPECT_EQ(tzdbDisToF(nullptr, 2, &value), Tzad::ePromptError);
    EXPECT_EQ(tzdbAngToF(L"1", -1, &value), Tzad::ePromptError);
    EXPECT_EQ(text, L"kept");
    EXPECT_EQ(value, 7);
}

struct ReadRow {
    wchar_t const* text;
    double value;
};

// Read alike under each unit.
constexpr ReadRow kLengthTexts[] = {
    {L"15.5", 15.5},       {L" +15.5 ", 15.5},   {L"1.5500E+01", 15.5},
    {L"-.5", -0.5},        {L"5.", 5},           {L"15 1/2", 15.5},
    {L"15-1/2", 15.5},     {L"1/4", 0.25},       {L"1'-3.5000\"", 15.5},
    {L"1'-3 1/2\"", 15.5}, {L"1'3-1/2\"", 15.5}, {L"1'3", 15},
    {L"-1'-3\"", -15},     {L"1'", 12},          {L"1.5'", 18},
    {L"3.5\"", 3.5},       {L"1/2\"", 0.5},      {L"1' 3 1/2", 15.5},
    {L"1e-400", 0},        {L"1e308", 1e308},
};

// Bare numbers follow the unit; these do not.
ReadRow const kAngleTexts[] = {
    {L"45d", kPi / 4},
    {L"45d30'0\"", 45.5 * kPi / 180},
    {L"45D30", 45.5 * kPi / 180},
    {L"22d30'36\"", 22.51 * kPi / 180},
    {L"30'", kPi / 360},
    {L"-45d", -kPi / 4},
    {L"50.0000g", kPi / 4},
    {L"0.5r", 0.5},
    {L"N 45d0'0\" E", kPi / 4},
    {L"n45w", 3 * kPi / 4},
    {L"S 0d W", 3 * kPi / 2},
    {L"s 90 e", 2 * kPi},
    {L"E", 0},
    {L"w", kPi},
    {L"450d", 2.5 * kPi},
    {L"3600\"", kPi / 180},
};

void expectRead(Reader read, ReadRow const& row, int firstUnit, int lastUnit) {
    for (int unit = firstUnit; unit <= lastUnit; ++unit) {
        double value = -99;
        EXPECT_EQ(read(row.text, unit, &value), Tzad::ePromptNormal)
            << TzString(row.text).toUtf8() << " in unit " << unit;
        EXPECT_NEAR(value, row.value, 1e-12 * std::max(1.0, std::fabs(row.value)))
            << TzString(row.text).toUtf8() << " in unit " << unit;
    }
}

TEST(Lengths, ReadEachFormUnderEachUnit) {
    for (ReadRow const& row : kLengthTexts)
        expectRead(tzdbDisToF, row, 1, 5);
}

TEST(Angles, ReadEachFormUnderEachUnit) {
    for (ReadRow const& row : kAngleTexts)
        expectRead(tzdbAngToF, row, 0, 4);
}

TEST(Angles, ReadBareNumbersInTheUnit) {
    constexpr double kQuarterTurn[] = {90, 90, 100, kPi / 2, 90};
    for (int unit = 0; unit < 5; ++unit) {
        double value = 0;
        TzString const text = TzString::formatted(L"%.17g", kQuarterTurn[unit]);
        EXPECT_EQ(tzdbAngToF(text, unit, &value), Tzad::ePromptNormal);
        EXPECT_NEAR(value, kPi / 2, 1e-12);
    }
}

TEST(Units, RefuseWhatIsNoValue) {
    constexpr wchar_t const* kNoLength[] = {L"",      L" ",   L"x",    L"1x",  L"1 2",     L"1/0",
                                            L"nan",   L"inf", L"0x10", L"1e",  L"1'2'",    L"--1",
                                            L"1e999", L"1,5", L"１",   L"5-3", L"1'-1/2x", L"."};
    for (wchar_t const* text : kNoLength) {
        double value = 7;
        EXPECT_EQ(tzdbDisToF(text, 2, &value), Tzad::ePromptError) << TzString(text).toUtf8();
        EXPECT_EQ(value, 7);
    }
    constexpr wchar_t const* kNoAngle[] = {L"",       L"45x",    L"N45",   L"N 91d E", L"E45N",
                                           L"N45 30", L"45d30g", L"N 4 S", L"-N45E"};
    for (wchar_t const* text : kNoAngle) {
        double value = 7;

        EXPECT_EQ(tzdbAngToF(text, 0, &value), Tzad::ePromptError) << TzString(text).toUtf8();
    }
}

// What is written in a unit reads back under every other one, to what the precision keeps.
TEST(Units, ReadBackWhatIsWritten) {
    for (double const value : {0.0, 0.375, -15.5, 100.0625, 3e5}) {
        for (int unit = 1; unit <= 5; ++unit) {
            TzString text;
            ASSERT_EQ(tzdbRToS(value, unit, 8, text), Tzad::ePromptNormal);
            expectRead(tzdbDisToF, {text, value}, 1, 5);
        }
    }
    for (double const degrees : {0.0, 12.5, 90.0, 123.25, 180.0, 271.75}) {
        for (int unit : {1, 4}) {
            TzString text;
            ASSERT_EQ(tzdbAngToS(degrees * kPi / 180, unit, 8, text), Tzad::ePromptNormal);
            expectRead(tzdbAngToF, {text, degrees * kPi / 180}, 0, 4);
        }
    }
}

}  // namespace
