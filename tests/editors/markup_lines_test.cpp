#include <gtest/gtest.h>

#include "host/editors/markup_lines.h"
#include "host/editors/program.h"

namespace {

using namespace tzhost;

struct LinesCase {
    char const* name;
    wchar_t const* markup;
    wchar_t const* lines;
};
constexpr LinesCase kBothWays[] = {
    {"Plain", L"abc", L"abc"},
    {"Paragraphs", L"A\\PB\\P", L"A\nB\n"},
    {"LineFeed", L"A\nB", L"A\\U+000AB"},
    {"EscapedBackslash", L"A\\\\PB", L"A\\\\PB"},  // the letter P after a literal backslash
    {"BackslashThenParagraph", L"A\\\\\\PB", L"A\\\\\nB"},
    {"OtherCodes", L"{\\H2x;\\fArial|b1;x}", L"{\\H2x;\\fArial|b1;x}"},
    {"LowerCaseP", L"\\pi1;x", L"\\pi1;x"},
    {"LoneBackslashAtTheEnd", L"A\\", L"A\\"},
    {"Empty", L"", L""},
};
class MarkupLines : public testing::TestWithParam<LinesCase> {};

TEST_P(MarkupLines, TurnIntoLinesAndBack) {
    EXPECT_EQ(markupToLines(GetParam().markup), GetParam().lines);
    EXPECT_EQ(linesToMarkup(std::wstring(GetParam().lines) + L"\n"), GetParam().markup);
}
INSTANTIATE_TEST_SUITE_P(BothWays, MarkupLines, testing::ValuesIn(kBothWays), [](auto const& row) {
    return row.param.name;
});

TEST(MarkupLines, TakeWhatEditorsOfOtherSystemsLeave) {
    EXPECT_EQ(linesToMarkup(L"A\r\nB\r\n"), L"A\\PB");
    EXPECT_EQ(linesToMarkup(L"A\n\nB"), L"A\\P\\PB");
    EXPECT_EQ(linesToMarkup(L"A\\\nB"),
              L"A\\\\\\PB");  // a lone backslash is doubled, not made a code
}

TEST(EditorCommand, ComesApartAtBlanksButNotInQuotes) {
    using Words = std::vector<std::string>;
    EXPECT_EQ(splitCommand("vi"), Words{"vi"});
    EXPECT_EQ(splitCommand("  a  -b\tc "), (Words{"a", "-b", "c"}));
    EXPECT_EQ(splitCommand("'my editor' \"-x y\"z ''"), (Words{"my editor", "-x yz", ""}));
    EXPECT_TRUE(splitCommand(" ").empty());
}

}  // namespace
