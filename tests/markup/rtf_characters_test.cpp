// Characters to rich text escapes and back, through the code pages.

#include <string_view>

#include <gtest/gtest.h>

#include "module/markup/read_rtf/rtf_characters.h"
#include "module/markup/shared/number_text.h"
#include "module/markup/shared/rtf_escapes.h"

namespace {

TEST(Escapes, AreWrittenForTheLowByte) {
    struct Row {
        wchar_t c;
        wchar_t const* handled;
        wchar_t const* expanded;
    };
    constexpr Row kRows[] = {
        {L'A', L"A", L"\\'41"},
        {0x7F, L"\x7F", L"\\'7f"},
        {0x80, L"\\'80", L"\\'80"},
        {0xE9, L"\\'e9", L"\\'e9"},
        {0x4E2D, L"\\'2d", L"\\'2d"},
        {0x1F600, L"\\'00", L"\\'00"},
        {0x10041, L"\U00010041", L"\\'41"},  // bits above 16 are not looked at
    };
    for (Row const& row : kRows) {
        EXPECT_STREQ(Handle8Bits(row.c).c_str(), row.handled);
        EXPECT_STREQ(Expand8Bits(row.c).c_str(), row.expanded);
    }
}

TEST(Escapes, OfTwoCharactersStopAtTheEnd) {
    wchar_t const* cursor = L"\x82\xA0x";
    EXPECT_STREQ(ExpandDoubleByte(cursor).c_str(), L"{\\dbch \\'82\\'a0}");
    EXPECT_STREQ(cursor, L"x");
    EXPECT_STREQ(ExpandDoubleByte(cursor).c_str(), L"{\\dbch x}");
    EXPECT_STREQ(ExpandDoubleByte(cursor).c_str(), L"{\\dbch }");
}

TEST(Escapes, OfTextsFollowThePage) {
    EXPECT_STREQ(HandleEscaped8Bits(L"A\u00E9", kCodePage1252).c_str(), L"A\\'e9");
    EXPECT_STREQ(HandleEscaped8Bits(L"\uFF2D\u3042", kCodePage932).c_str(), L"\\'82l\\'82\\'a0");
    EXPECT_STREQ(HandleEscaped8Bits(L"\u4E2D", kCodePage1252).c_str(), L"?");
}

TEST(Numbers, AreWrittenWithoutALocale) {
    std::wstring text;
    appendDecimal(text, -2147483648LL);
    text += L' ';
    for (double const value : {1.2, 0.1 + 0.2, 1e-5, 1234567.0, 100000.0, -0.0}) {
        appendReal(text, value);
        text += L' ';
    }
    appendReal(text, 1.23456, 4);
    for (unsigned int const value : {0U, 0xE9U, 0x12345U, 0xFFFFF0B7U}) {
        text += L' ';
        appendHex4(text, value);
    }
    EXPECT_EQ(text, L"-2147483648 1.2 0.3 1e-05 1.23457e+06 100000 -0 1.235 "
                    L"0000 00E9 12345 FFFFF0B7");
}

TEST(HexPairs, GoOverLineBreaks) {
    struct Row {
        wchar_t const* text;
        int value;
        std::wstring_view rest;
    };
    constexpr Row kRows[] = {
        {L"e9x", 0xE9, L"x"},     {L"E9", 0xE9, L""}, {L"\r\ne9x", 0xE9, L"x"},
        {L"\te\n9x", 0xE9, L"x"}, {L"g9", 0x09, L""},  // no hex digit reads as 0
        {L"e", 0xE0, L""},        {L"\r\n", 0, L""},  {L"", 0, L""},
    };
    for (Row const& row : kRows) {
        wchar_t const* cursor = row.text;
        EXPECT_EQ(locGetHexChar(cursor), row.value) << row.text;
        EXPECT_EQ(std::wstring_view(cursor), row.rest);
    }
}

struct EscapeCase {
    char const* name;
    int page;
    wchar_t const* text;  // after the \'
    wchar_t const* value;
    std::wstring_view rest;
};
constexpr EscapeCase kEscapes[] = {
    {"Latin", 1252, L"e9x", L"\u00E9", L"x"},
    {"LatinQuote", 1252, L"93", L"\u201C", L""},
    {"Cyrillic", 1251, L"c0\\'c1", L"\u0410", L"\\'c1"},
    {"Japanese", 932, L"82\\'a0x", L"\u3042", L"x"},
    {"JapaneseSplit", 932, L"82\r\n\\'\na\r0x", L"\u3042", L"x"},
    {"JapaneseBareTrail", 932, L"82lx", L"\uFF2D", L"x"},
    {"JapaneseBackslash", 932, L"83\\\\x", L"\u30BD", L"x"},
    {"JapaneseKana", 932, L"b1x", L"\uFF71", L"x"},
    {"LeadThenWord", 932, L"82\\par", L"\u0082", L"\\par"},
    {"LeadThenBrace", 932, L"82}", L"\u0082", L"}"},
    {"LeadThenOpenBrace", 932, L"82{", L"\u0082", L"{"},
    {"LeadAtTheEnd", 932, L"82", L"\u0082", L""},
    {"LeadThenBackslash", 932, L"82\\", L"\u0082", L"\\"},
    {"Chinese", 936, L"d6\\'d0x", L"\u4E2D", L"x"},
    {"Korean", 949, L"b0\\'a1x", L"\uAC00", L"x"},
    {"Big5", 950, L"a4\\'a4x", L"\u4E2D", L"x"},
    {"LatinSplit", 1252, L"\r\ne\t9x", L"\u00E9", L"x"},
    {"ChineseSplit", 936, L"d\n6\r\n\\'\td0x", L"\u4E2D", L"x"},
    {"TabBehindIsLost", 1252, L"e9\tx", L"\u00E9", L"x"},
    {"SingleByteIgnores", 1252, L"b0\\'a1", L"\u00B0", L"\\'a1"},
    {"NoSuchPair", 936, L"ff\\'ff", L"\u00FF", L"\\'ff"},
    {"UnknownPage", 4711, L"e9", L"\u00E9", L""},
    {"Utf8Page", 65001, L"e9", L"\u00E9", L""},
    {"Zero", 1252, L"zz", {L"\0"}, L""},
};

TEST(EscapedCharacters, AreDecodedByThePage) {
    for (EscapeCase const& row : kEscapes) {
        wchar_t const* cursor = row.text;
        CStdStrW const text = WideCharacterString(cursor, code_page_id_ex(row.page));
        EXPECT_STREQ(text.c_str(), row.value) << row.name;
        EXPECT_EQ(std::wstring_view(cursor), row.rest) << row.name;
    }
}

TEST(EscapedCharacters, GiveTheBytesAsOneValue) {
    wchar_t const* cursor = L"b0\\'a1";
    EXPECT_EQ(WideCharacter(cursor, kCodePage936), 0xB0A1);
    EXPECT_STREQ(cursor, L"");
    cursor = L"b0\\'a1";
    EXPECT_EQ(WideCharacter(cursor, kCodePage1252), 0xB0);
    EXPECT_STREQ(cursor, L"\\'a1");
    EXPECT_EQ(DoubleByteString(0xB0A1), "\xB0\xA1");
    EXPECT_EQ(DoubleByteString(0xA1), "\xA1");
}

constexpr EscapeCase kCharacters[] = {
    {"Bare", 1252, L"ab", L"a", L"b"},
    {"BareOverLines", 1252, L"\r\n\tab", L"a", L"b"},
    {"Escape", 1252, L"\\'e9b", L"\u00E9", L"b"},
    {"EscapeSplit", 1252, L"\\\n'\re9b", L"\u00E9", L"b"},
    {"EscapedPair", 932, L"\\'82\\'a0b", L"\u3042", L"b"},
    {"BareLead", 932,
     L"\x82\x6C"
     L"b",
     L"\uFF2D", L"b"},
    {"BareLeadSplit", 932,
     L"\x82\n\x6C"
     L"b",
     L"\uFF2D", L"b"},
    {"BareLeadAtTheEnd", 932, L"\x82", L"\u0082", L""},
    {"Backslash", 1252, L"\\\\ab", L"\\a", L"b"},
    {"BackslashAtTheEnd", 1252, L"\\\\", L"\\", L""},
    {"Word", 1252, L"\\par", L"", L"par"},
    {"Lone", 1252, L"\\", L"", L""},
    {"LoneOverLines", 1252, L"\\\r\n", L"", L""},
    {"WideLosesHighBits", 1252, L"\u4E41b", L"A", L"b"},
    {"Empty", 1252, L"\n", L"", L""},
};

TEST(Characters, OfFontTablesAreReadByBytes) {
    for (EscapeCase const& row : kCharacters) {
        wchar_t const* cursor = row.text;
        EXPECT_STREQ(GetCharacter(cursor, code_page_id_ex(row.page)).c_str(), row.value)
            << row.name;
        EXPECT_EQ(std::wstring_view(cursor), row.rest) << row.name;
    }
}

}  // namespace
