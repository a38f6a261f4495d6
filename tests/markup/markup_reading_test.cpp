// Numbers and texts read over a cursor, at their limits.

#include <cmath>
#include <string_view>

#include <gtest/gtest.h>

#include "module/markup/read_markup/markup_numbers.h"

namespace {

struct IntegerCase {
    char const* name;
    wchar_t const* text;
    int value;
    std::wstring_view rest;
};
constexpr IntegerCase kIntegers[] = {
    {"Closed", L"12;x", 12, L"x"},
    {"Open", L"12x", 12, L"x"},
    {"OneSemicolon", L"12;;", 12, L";"},
    {"None", L"x", 0, L"x"},
    {"SemicolonAlone", L";x", 0, L"x"},
    {"NoSign", L"-1;", 0, L"-1;"},
    {"Empty", L"", 0, L""},
    {"WideFirst", L"\u4E2D;", 0, L"\u4E2D;"},
    {"WideBehind", L"7\u4E2D;", 7, L"\u4E2D;"},
    {"OtherDigits", L"\u0661;", 0, L"\u0661;"},
    {"Largest", L"2147483647;", 2147483647, L""},
    {"WrapsByOne", L"2147483648;", -2147483647 - 1, L""},
    {"WrapsAround", L"4294967297;", 1, L""},
    {"TwentyDigits", L"12345678901234567890", -350287150, L""},
};

TEST(Integers, AreReadAs) {
    for (IntegerCase const& row : kIntegers) {
        wchar_t const* cursor = row.text;
        EXPECT_EQ(GetNumber(cursor), row.value) << row.name;
        EXPECT_EQ(std::wstring_view(cursor), row.rest) << row.name;
    }
}

struct RealCase {
    char const* name;
    wchar_t const* text;
    double value;
    bool isRelative;
    std::wstring_view rest;
};
constexpr RealCase kReals[] = {
    {"Relative", L"1.5x;", 1.5, true, L""},
    {"CapitalMark", L"2X;", 2.0, true, L""},
    {"NoLeadingDigit", L"-.5", -0.5, false, L""},
    {"PointAlone", L".;x", 0.0, false, L"x"},
    {"NoPlus", L"+1;", 0.0, false, L"+1;"},
    {"NoExponent", L"1e5;", 1.0, false, L"e5;"},
    {"MarkAlone", L"x;", 0.0, true, L""},
    {"TwoPoints", L"1.2.3;", 1.2, false, L".3;"},
    {"WideFirst", L"\u4E2D1;", 0.0, false, L"\u4E2D1;"},
    {"Empty", L"", 0.0, false, L""},
    {"Sum", L"0.25;", 2 / 10.0 + 5 / 100.0, false, L""},
};

TEST(Reals, AreReadAs) {
    for (RealCase const& row : kReals) {
        wchar_t const* cursor = row.text;
        signed char isRelative = 5;
        EXPECT_EQ(GetRealNumber(cursor, &isRelative, true), row.value) << row.name;
        EXPECT_EQ(isRelative != 0, row.isRelative) << row.name;
        EXPECT_EQ(std::wstring_view(cursor), row.rest) << row.name;
    }
}

TEST(Reals, LeaveTheSemicolonWhenNotAskedFor) {
    wchar_t const* cursor = L"1.5x;y";
    EXPECT_EQ(GetRealNumber(cursor, nullptr, false), 1.5);
    EXPECT_STREQ(cursor, L";y");
}

TEST(Reals, OfAnyLengthEndAtInfinityOrTheirLastBit) {
    std::wstring const many(400, L'9');
    wchar_t const* cursor = many.c_str();
    EXPECT_TRUE(std::isinf(GetRealNumber(cursor, nullptr, true)));
    std::wstring const fraction = L"0." + many;
    cursor = fraction.c_str();
    EXPECT_NEAR(GetRealNumber(cursor, nullptr, true), 1.0, 1e-15);
    EXPECT_EQ(*cursor, 0);
}

struct TextCase {
    char const* name;
    wchar_t const* text;
    std::wstring_view value;
    std::wstring_view rest;
};
constexpr TextCase kTexts[] = {
    {"Closed", L"1/2;x", L"1/2", L"x"},
    {"Empty", L";x", L"", L"x"},
    {"Open", L"abc", L"abc", L""},
    {"EscapeHidesTheNext", L"\\;;x;", L"\\;;x", L""},
    {"HiddenBackslash", L"\\a\\;x;", L"\\a\\", L"x;"},
    {"PairAtTheEnd", L"a\\;", L"a\\;", L""},
    {"LoneBackslash", L"a\\", {L"a\\\0", 3}, L""},
};

TEST(Texts, EndAtTheSemicolon) {
    for (TextCase const& row : kTexts) {
        wchar_t const* cursor = row.text;
        EXPECT_EQ(std::wstring_view(GetString(cursor)), row.value) << row.name;
        EXPECT_EQ(std::wstring_view(cursor), row.rest) << row.name;
    }
}

TEST(HexValues, StandBehindTheCursorsCharacter) {
    struct Row {
        wchar_t const* text;
        int value;
        std::wstring_view rest;
    };
    constexpr Row kRows[] = {
        {L"+4E2Dx", 0x4E2D, L"x"}, {L"+4e2d", 0x4E2D, L""}, {L"+4Eg2", 0, L"2"},
        {L"+4E", 0, L""},          {L"+", 0, L""},          {L"", 0, L""},
    };
    for (Row const& row : kRows) {
        wchar_t const* cursor = row.text;
        EXPECT_EQ(Get4ByteHexValue(cursor), row.value) << row.text;
        EXPECT_EQ(std::wstring_view(cursor), row.rest);
    }
}

TEST(UnicodeCodes, ConvertBothWays) {
    struct Row {
        wchar_t const* text;
        int isHex;
        wchar_t const* value;  // null: refused
    };
    constexpr Row kRows[] = {
        {L"233?", 0, L"\\U+00E9"},    {L"?", 0, L"\\U+0000"},
        {L"-?", 0, L"\\U+0000"},      {L"-3913?", 0, L"\\U+FFFFF0B7"},
        {L"12345?", 0, L"\\U+3039"},  {L"123456?", 0, nullptr},
        {L"-12345?", 0, nullptr},     {L"12a?", 0, nullptr},
        {L"1-2?", 0, nullptr},        {L"12", 0, nullptr},
        {L"00e9rest", 1, L"\\u233?"}, {L"4E2D", 1, L"\\u20013?"},
        {L"4E2", 1, nullptr},         {L"4E2g", 1, nullptr},
    };
    for (Row const& row : kRows) {
        CStdStrW out(L"old");
        EXPECT_EQ(ConvertUSequence(row.text, out, static_cast<signed char>(row.isHex)),
                  row.value != nullptr);
        EXPECT_STREQ(out.c_str(), row.value ? row.value : L"");
    }
}

TEST(UnicodeCodes, OfMarkupTakeFiveCharacters) {
    struct Row {
        wchar_t const* text;
        wchar_t const* value;
        std::wstring_view rest;
    };
    constexpr Row kRows[] = {
        {L"\\U+00E9x", L"\\u233?", L"x"}, {L"\\u+4e2d", L"\\u20013?", L""},
        {L"\\Uabcdefg", L"\\u0?", L"fg"}, {L"\\U+00", L"\\u0?", L""},
        {L"\\U", L"\\u0?", L""},
    };
    for (Row const& row : kRows) {
        wchar_t const* cursor = row.text + 2;
        EXPECT_STREQ(ConvertMTextUSequence(cursor).c_str(), row.value) << row.text;
        EXPECT_EQ(std::wstring_view(cursor), row.rest);
    }
}

}  // namespace
