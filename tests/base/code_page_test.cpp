// Code pages, the codes of single characters, and the format mark of a text.

#include <gtest/gtest.h>

#include "host/settings/variables.h"
#include "tz/text/code_page.h"
#include "tz/text/text_editor.h"

namespace {

TEST(CodePages, BelongToCharsetsBothWays) {
    struct Row {
        int charset;
        int page;
    };
    constexpr Row kRows[] = {{0, 1252}, {2, 42}, {128, 932}, {130, 1361}, {163, 1258}, {255, 437}};
    for (Row const& row : kRows) {
        auto const page = static_cast<code_page_id>(row.page);
        EXPECT_EQ(TzCodePage::CharSetToCodePageId(static_cast<Charset>(row.charset)), page);
        EXPECT_EQ(TzCodePage::CodePageIdToCharSet(page), row.charset);
    }
    for (int const other : {1, 3, -1, 4711}) {
        EXPECT_EQ(TzCodePage::CharSetToCodePageId(static_cast<Charset>(other)), 1252) << other;
    }
    EXPECT_EQ(TzCodePage::CodePageIdToCharSet(kCodePageUtf8), kAnsiCharset);
}

TEST(CodePages, KnowTheirLeadBytes) {
    struct Row {
        int page;
        int byte;
        bool isLead;
    };
    constexpr Row kRows[] = {{932, 0x81, true},   {932, 0xA0, false},  {932, 0xDF, false},
                             {932, 0xE0, true},   {932, 0xFD, false},  {936, 0x80, false},
                             {936, 0xFE, true},   {949, 0xFF, false},  {950, 0x81, true},
                             {1361, 0x83, false}, {1361, 0xD4, false}, {1361, 0xF9, true},
                             {1252, 0xE9, false}, {65001, 0xE9, false}};
    for (Row const& row : kRows) {
        EXPECT_EQ(TzCharacterCheck::IsLeadByte(static_cast<code_page_id>(row.page),
                                               static_cast<unsigned char>(row.byte)),
                  row.isLead)
            << row.page << ' ' << row.byte;
    }
}

struct DecodeRow {
    char const* name;
    int page;
    char const* bytes;
    wchar_t const* text;  // null: cannot be decoded
};
constexpr DecodeRow kDecodeRows[] = {
    {"Western", 1252, "caf\xE9 \x80", L"café €"},
    {"UndefinedByte", 1252, "a\x81", nullptr},
    {"Japanese", 932, "\x83\x5C\x5C\xB1",
     L"ソ\\ｱ"},  // a trail byte and a character that are backslashes
    {"SimplifiedChinese", 936, "\xBA\xBAZ", L"汉Z"},
    {"TraditionalChinese", 950, "\xBA\x7E", L"漢"},
    {"Korean", 949, "\xC7\xD1", L"한"},
    {"Johab", 1361, "\xD0\x65\\", L"한\\"},  // the backslash stays one
    {"CutLeadByte", 932, "\x83", nullptr},
    {"BadTrailByte", 936, "\xBA\x20", nullptr},
    {"Cyrillic", 1251, "\xCF\xF0\xE8", L"При"},
    {"Thai", 874, "\xA1", L"ก"},
    {"Utf8IsNoPage", 65001, "\xC3\xA9", L"Ã©"},
    {"UnknownIsTheSystem", 4711, "\xE9", L"é"},
    {"NegativeIsTheSystem", -5, "\xE9", L"é"},
    {"Empty", 1252, "", L""},
};
class Decoding : public testing::TestWithParam<DecodeRow> {};
TEST_P(Decoding, ReadsAs) {
    CStdStrW text = L"before";
    bool const done = UnicodeConvert::multibyteToWide(GetParam().page, GetParam().bytes, text);
    EXPECT_EQ(done, GetParam().text != nullptr);
    EXPECT_EQ(text, GetParam().text ? GetParam().text : L"");
}
INSTANTIATE_TEST_SUITE_P(Pages, Decoding, testing::ValuesIn(kDecodeRows), [](auto const& row) {
    return row.param.name;
});

TEST(Encoding, WritesAQuestionMarkForWhatAPageLacks) {
    struct Row {
        wchar_t const* text;
        int page;
        char const* bytes;
    };
    constexpr Row kRows[] = {{L"a漢é€", 1252, "a?\xE9\x80"}, {L"漢\x1F600\\", 932, "\x8A\xBF?\\"},
                             {L"é", 65001, "\xE9"},          {L"é", 1251, "?"},
                             {L"“x”", 20127, "?x?"},         {L"é\xD800", 1252, "\xE9?"}};
    for (Row const& row : kRows) {
        EXPECT_EQ(TextEditor::UnicodeToMultiByte(row.text, static_cast<code_page_id>(row.page)),
                  row.bytes)
            << row.page;
    }
}

TEST(SystemPage, FollowsItsVariable) {
    struct Row {
        wchar_t const* value;
        int page;
        int charset;
    };
    auto& store = tzhost::Variables::instance();
    for (Row const& row : {Row{L"ANSI_932", 932, 128},
                           {L"dos_437", 437, 255},
                           {L"1251", 1251, 204},
                           {L"ANSI_", 1252, 0},
                           {L"UTF-8", 1252, 0},
                           {L"ANSI_99999999999", 1252, 0},
                           {L"ANSI_1252", 1252, 0}}) {
        ASSERT_TRUE(
            store.set(L"SYSCODEPAGE", std::wstring(row.value), tzhost::Writer::host).isDone());
        EXPECT_EQ(Locale::getSystemCodePageIdEx().number(), row.page) << row.value;
        EXPECT_EQ(TzCodePage::SysCharset(), row.charset) << row.value;
        EXPECT_EQ(TzCodePage::CharSetToCodePageId(kDefaultCharset), row.page);
    }
}

struct CodeRow {
    wchar_t const* text;
    int unicode;  // -1: no such code
    int page;     // 0: no such code
    int bytes;
};
constexpr CodeRow kCodeRows[] = {
    {L"\\U+00e9x", 0xE9, 0, 0},
    {L"\\u+FFFF", 0xFFFF, 0, 0},
    {L"\\U+0000", 0, 0, 0},
    {L"\\U+00E", -1, 0, 0},
    {L"\\U00E9", -1, 0, 0},
    {L"\\", -1, 0, 0},
    {L"", -1, 0, 0},
    {L"\\M+18ABF", -1, 932, 0x8ABF},
    {L"\\m+5d065", -1, 1361, 0xD065},
    {L"\\M+6ABCD", -1, 0, 0},
    {L"\\M+0ABCD", -1, 0, 0},
    {L"\\M+1ABC", -1, 0, 0},
    {L"\\M+2BABA", -1, 936, 0xBABA},
    {L"\\M+3C7D1", -1, 949, 0xC7D1},
    {L"\\M+4BA7E", -1, 950, 0xBA7E},
};
TEST(CharacterCodes, AreRecognised) {
    for (CodeRow const& row : kCodeRows) {
        int code = 77;
        EXPECT_EQ(getCIF(row.text, code), row.unicode >= 0) << row.text;
        EXPECT_EQ(code, row.unicode >= 0 ? row.unicode : 0);
        code_page_id page = kCodePageUtf8;
        EXPECT_EQ(getMIF(row.text, page, code), row.page != 0) << row.text;
        EXPECT_EQ(page, row.page);
        EXPECT_EQ(code, row.bytes);
    }
}

// Shows what initialize found.
class Engine : public TextEditor {
public:
    Engine() : TextEditor(nullptr, true, false, false, false, 0, 0, 0, false, false) {}
    [[nodiscard]] std::wstring const& unreadable() const { return unreadable_; }
};
TEST(FormatMark, IsReadAtTheStartOnly) {
    struct Row {
        wchar_t const* markup;
        int format;
        wchar_t const* unreadable;
    };
    constexpr Row kRows[] = {{L"plain", 0, L""},    {L"\\?4;text", 4, L""},
                             {L"\\?12;", 12, L""},  {L"\\?;text", 0, L"\\?;"},
                             {L"\\?4text", 0, L""}, {L"a\\?4;", 0, L""},
                             {L"\\?x;", 0, L""},    {L"\\?", 0, L""},
                             {L"", 0, L""},         {L"\\?99999999999;", 2147483647, L""}};
    for (Row const& row : kRows) {
        Engine engine;
        engine.initialize(row.markup);
        EXPECT_EQ(engine.unreadable(), row.unreadable) << row.markup;
        EXPECT_EQ(engine.from_mtext(row.markup), row.format) << row.markup;
        engine.uninitialize();
        EXPECT_EQ(engine.unreadable(), L"");
    }
}

}  // namespace
