// The colour and font tables of a document.

#include <gtest/gtest.h>

#include "module/markup/shared/rtf_color_table.h"
#include "module/markup/shared/rtf_font_table.h"
#include "tz/gi/color.h"

namespace {

TEST(ColorTable, NumbersColorsByPlace) {
    CRichTextColorTable colors;
    EXPECT_STREQ(colors.EmitColorTable().c_str(), L"{\\colortbl}");
    EXPECT_EQ(colors.AddColor(0x112233U, false), 0);
    EXPECT_EQ(colors.AddColor(0x0000FFU, false), 1);
    EXPECT_EQ(colors.AddColor(0x112233U, false), 0);
    EXPECT_EQ(colors.AddColor(0x112233U, true), 2);
    EXPECT_EQ(colors.FindColor(0x112233U), 0);
    EXPECT_EQ(colors.FindColor(0x332211U), -1);
    EXPECT_STREQ(colors.EmitColorTable().c_str(),
                 L"{\\colortbl\\red51\\green34\\blue17;\\red255\\green0\\blue0;"
                 L"\\red51\\green34\\blue17;}");
}

TEST(ColorTable, AnswersWithColorAndIndex) {
    CRichTextColorTable colors;
    colors.SetByLayerColor(0x0000FF);
    colors.SetByBlockColor(0x00FF00);
    colors.AddColor(256, false);
    colors.AddColor(0, false);
    colors.AddColor(5, false);
    colors.AddColor(0xFF0102U, false);
    struct Row {
        int number;
        bool isThere;
        unsigned int rgb;
        int index;
    };
    constexpr Row kRows[] = {
        {0, true, 0x0000FF, 256},  // red is ByLayer here, not index 1
        {1, true, 0x00FF00, 0},   {2, true, 0xFF0000, 5}, {3, true, 0xFF0102, 5},
        {4, false, 0, 0},         {-1, false, 0, 0},
    };
    for (Row const& row : kRows) {
        unsigned int rgb = 9;
        int index = 9;
        EXPECT_EQ(colors.GetColor(row.number, rgb), row.isThere) << row.number;
        EXPECT_EQ(colors.GetColor(row.number, &index), row.isThere) << row.number;
        EXPECT_EQ(rgb, row.rgb) << row.number;
        EXPECT_EQ(index, row.index) << row.number;
    }
    colors.SetByBlockColor(0x0000FF);
    EXPECT_EQ(colors.GetTzadIndex(0x0000FF), 256);  // ByLayer is asked for first
    EXPECT_EQ(CRichTextColorTable::GetRGB(256, 7, 8), 7U);
    EXPECT_EQ(CRichTextColorTable::GetRGB(0, 7, 8), 8U);
    EXPECT_EQ(CRichTextColorTable::GetRGB(300, 7, 8), 0U);
}

TEST(FontTable, WritesItsFonts) {
    struct Row {
        int charset;
        int pitch;
        wchar_t const* name;
        wchar_t const* text;
    };
    constexpr Row kRows[] = {
        {0, 0, L"Arial", L"\\fnil\\fcharset0 Arial;"},
        {0, 0x22, L"Arial", L"\\fswiss\\fprq2\\fcharset0 Arial;"},
        {1, 0x11, L"A;}", L"\\froman\\fprq1\\fcharset1 A;};"},
        {204, 0x31, L"\u0410", L"\\fmodern\\fprq1\\fcharset204 \\'c0;"},
        {128, 0x42, L"\uFF2D", L"\\fscript\\fprq2\\fcharset128 \\'82l;"},
        {2, 0x50, L"", L"\\fdecor\\fcharset2 ;"},
        {0, 0x60, L"x", L"\\fnil\\fcharset0 x;"},
    };
    EXPECT_STREQ(CRichTextFontTable().EmitFontTable().c_str(), L"{\\fonttbl}");
    for (Row const& row : kRows) {
        CRichTextFontTable fonts;
        EXPECT_EQ(fonts.AddFont(row.name, static_cast<Charset>(row.charset), row.pitch), 0);
        EXPECT_EQ(fonts.EmitFontTable(), L"{\\fonttbl{\\f0" + std::wstring(row.text) + L"}}");
    }
}

TEST(FontTable, FindsTheFirstFontWhateverTheCase) {
    CRichTextFontTable fonts;
    EXPECT_EQ(fonts.AddFont(L"Arial", kAnsiCharset, 0), 0);
    EXPECT_EQ(fonts.AddFont(L"ARIAL", kAnsiCharset, 0), 0);
    EXPECT_EQ(fonts.AddFont(L"Arial", kAnsiCharset, 1), 1);
    EXPECT_EQ(fonts.AddFont(L"Arial", kDefaultCharset, 0), 2);
    EXPECT_EQ(fonts.FindFont(L"Arial2", kAnsiCharset, 0), -1);
    fonts.AddFont(9LL, L"Late", kAnsiCharset, 0);
    fonts.AddFont(4LL, L"late", kAnsiCharset, 0);
    EXPECT_EQ(fonts.FindFont(L"LATE", kAnsiCharset, 0), 4);
    EXPECT_EQ(fonts.AddFont(L"Next", kAnsiCharset, 0), 10);
    fonts.AddFont(4LL, L"Other", kAnsiCharset, 0);
    EXPECT_EQ(fonts.FindFont(L"Late", kAnsiCharset, 0), 9);
}

TEST(FontTable, KeepsTheNumbersOfADocument) {
    CRichTextFontTable fonts;
    fonts.AddFont(2000000000LL, L"Far", kRussianCharset, 0x22);
    fonts.AddFont(5LL, L"Near", kAnsiCharset, 0);
    fonts.AddFont(-1LL, L"Lost", kAnsiCharset, 0);
    fonts.AddFont(5000000000LL, L"Lost", kAnsiCharset, 0);
    CStdStrW name;
    Charset charset{};
    int pitch = 0;
    EXPECT_TRUE(fonts.GetFont(2000000000, name, charset, pitch));
    EXPECT_STREQ(name.c_str(), L"Far");
    EXPECT_EQ(charset, kRussianCharset);
    EXPECT_EQ(pitch, 0x22);
    for (int const slot : {-1, 2, 705032704}) {
        EXPECT_FALSE(fonts.GetFont(slot, name, charset, pitch)) << slot;
        EXPECT_TRUE(name.empty());
        EXPECT_EQ(pitch, 0);
    }
    EXPECT_STREQ(fonts.EmitFontTable().c_str(),
                 L"{\\fonttbl{\\f5\\fnil\\fcharset0 Near;}"
                 L"{\\f2000000000\\fswiss\\fprq2\\fcharset204 Far;}}");
}

}  // namespace
