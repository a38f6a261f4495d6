// The host's text: formatting, UTF-8 and letter case.

#include <gtest/gtest.h>

#include <clocale>
#include <limits>

#include "host/text/utf8.h"
#include "tz/text/std_str.h"
#include "tz/text/string.h"

namespace {

TEST(Format, TakesWideTextForEveryTextConversion) {
    EXPECT_EQ(TzString::formatted(L"%s|%ls|%S", L"Größe", L"\x1F600", L"c").str(),
              L"Größe|\x1F600|c");
    EXPECT_EQ(TzString::formatted(L"%hs", "narrow \xC3\xA9").str(), L"narrow é");
    EXPECT_EQ(TzString::formatted(L"[%5s][%-5s][%.2s]", L"ab", L"ab", L"abcd").str(),
              L"[   ab][ab   ][ab]");
    EXPECT_EQ(TzString::formatted(L"%c%lc", L'é', L'漢').str(), L"é漢");
    EXPECT_EQ(TzString::formatted(L"%s", static_cast<wchar_t const*>(nullptr)).str(), L"(null)");
}

struct NumberRow {
    char const* name;
    wchar_t const* format;
    double value;
    wchar_t const* text;
};
constexpr NumberRow kNumbers[] = {
    {"Short", L"%g", 0.2, L"0.2"},
    {"FourDigits", L"\\H%0.4gx;", 1.23456, L"\\H1.235x;"},
    {"Fixed", L"%8.3f|", -1.5, L"  -1.500|"},
    {"LeftInWidth", L"%-8.1e|", 1.0, L"1.0e+00 |"},
    {"Percent", L"%g%%", 50.0, L"50%"},
    {"EndsInsideConversion", L"%g then %", 1.0, L"1 then "},
    {"UnknownConversion", L"%g then %y more", 1.0, L"1 then "},
};
class FormattedNumber : public testing::TestWithParam<NumberRow> {};
TEST_P(FormattedNumber, ReadsAs) {
    EXPECT_EQ(TzString::formatted(GetParam().format, GetParam().value).str(), GetParam().text);
}
INSTANTIATE_TEST_SUITE_P(Forms, FormattedNumber, testing::ValuesIn(kNumbers), [](auto const& row) {
    return row.param.name;
});

TEST(Format, HoldsEveryWidthOfIntegers) {
    EXPECT_EQ(TzString::formatted(L"%d %lu %lld %04X %hhd %zu", -1, ~0UL, 1LL << 40, 0xABU, 300,
                                  sizeof(int))
                  .str(),
              L"-1 18446744073709551615 1099511627776 00AB 44 4");
    EXPECT_EQ(TzString::formatted(L"[%*d][%-*d][%.*f]", 4, 7, -3, 8, 1, 2.25).str(),
              L"[   7][8  ][2.2]");
    EXPECT_EQ(TzString::formatted(L"%f", std::numeric_limits<double>::max()).length(), 316);
    EXPECT_EQ(TzString::formatted(L"%600d", 1).length(), 600);
}

TEST(Format, FollowsNoLocale) {
    char const* const names[] = {"de_DE.UTF-8", "fr_FR.UTF-8", "C.UTF-8"};
    for (char const* name : names) {
        if (std::setlocale(LC_ALL, name) != nullptr) break;
    }
    TzString const text = TzString::formatted(L"%.1f", 1.5);
    std::setlocale(LC_ALL, "C");
    EXPECT_EQ(text.str(), L"1.5");
}

struct Utf8Row {
    char const* name;
    std::string_view bytes;
    std::wstring_view text;
    std::size_t bad;
};
constexpr Utf8Row kUtf8[] = {
    {"Plain", "abc", L"abc", tzhost::kAllUtf8},
    {"EveryLength", "\xC3\xA9\xE6\xBC\xA2\xF0\x9F\x98\x80", L"é漢\x1F600", tzhost::kAllUtf8},
    {"Overlong", "a\xC0\x80", L"a\xFFFD\xFFFD", 1},
    {"Surrogate", "\xED\xA0\x80", L"\xFFFD\xFFFD\xFFFD", 0},
    {"AboveTheLast", "\xF4\x90\x80\x80", L"\xFFFD\xFFFD\xFFFD\xFFFD", 0},
    {"CutOff", "ab\xE6\xBC", L"ab\xFFFD\xFFFD", 2},
    {"LoneTail", "\x80z", L"\xFFFDz", 0},
};
class Utf8 : public testing::TestWithParam<Utf8Row> {};
TEST_P(Utf8, ReadsAs) {
    EXPECT_EQ(tzhost::fromUtf8(GetParam().bytes), GetParam().text);
    EXPECT_EQ(tzhost::firstBadByte(GetParam().bytes), GetParam().bad);
    if (GetParam().bad == tzhost::kAllUtf8) {
        EXPECT_EQ(tzhost::toUtf8(GetParam().text), GetParam().bytes);
    }
}
INSTANTIATE_TEST_SUITE_P(Forms, Utf8, testing::ValuesIn(kUtf8), [](auto const& row) {
    return row.param.name;
});

TEST(Utf8, WritesNoSurrogates) {
    std::wstring const text = {L'a', static_cast<wchar_t>(0xD800), static_cast<wchar_t>(0x110000),
                               -5};
    EXPECT_EQ(tzhost::toUtf8(text), "a\xEF\xBF\xBD\xEF\xBF\xBD\xEF\xBF\xBD");
}

struct CaseRow {
    wchar_t upper;
    wchar_t lower;
};
constexpr CaseRow kCases[] = {
    {L'A', L'a'}, {L'Z', L'z'}, {0xC4, 0xE4},   {0x178, 0xFF},      {0x100, 0x101},
    {L'Ω', L'ω'}, {L'Ж', L'ж'}, {0x531, 0x561}, {0x10400, 0x10428}, {0x1E00, 0x1E01},
};
TEST(LetterCase, GoesBothWays) {
    for (CaseRow const& row : kCases) {
        EXPECT_EQ(tzToLower(row.upper), row.lower);
        EXPECT_EQ(tzToUpper(row.lower), row.upper);
        EXPECT_EQ(tzToLower(row.lower), row.lower);
    }
    for (wchar_t const c : {L'[', L'`', L'@', L'ß', L'漢', static_cast<wchar_t>(0xD7),
                            wchar_t{0x101}, static_cast<wchar_t>(-1)}) {
        EXPECT_EQ(tzToLower(c), c);
    }
    EXPECT_EQ(tzToLower(0x130), L'i');
}

TEST(LetterCase, ComparesByTheTable) {
    EXPECT_EQ(tzCompareNoCase(L"ÄRIAL", L"ärial"), 0);
    EXPECT_LT(tzCompareNoCase(L"a", L"AB"), 0);
    EXPECT_GT(tzCompareNoCase(L"b", L"AB"), 0);
    EXPECT_EQ(tzCompareNoCase(nullptr, L""), 0);
}

TEST(StdStr, ReplacesAndFormats) {
    CStdStrW text;
    text.Fmt(L"%s|b%d", L"Face", 1);
    EXPECT_EQ(text.MakeLower(), L"face|b1");
    EXPECT_EQ(text.Replace(L"e", L"ee"), 1);
    EXPECT_EQ(text, L"facee|b1");
    EXPECT_EQ(text.Mid(99), L"");
    EXPECT_EQ(text.Right(2), L"b1");
}

}  // namespace
