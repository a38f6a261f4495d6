#include "apps/tzdraft/completion.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>

namespace {

struct WordCase {
    char const* name;
    std::wstring_view typed;
    std::wstring insert;
    std::wstring choices;  // a blank after each
};

std::vector<std::wstring> const kWords{L"LIST",   L"LINE",        L"LOAD",   L"MTEXT",
                                       L"-MTEXT", L"Überschrift", L"_MTEXT", L"_CIRCLE"};

WordCase const kWordCases[] = {
    {"OneWord", L"MT", L"EXT", L""},
    {"SmallLetters", L"mt", L"ext", L""},
    {"Dash", L"-", L"MTEXT", L""},
    {"GlobalMark", L"_mtex", L"t", L""},
    {"BehindABlank", L"all loa", L"d", L""},
    {"CommonPart", L"L", L"", L"LINE LIST LOAD "},
    {"CommonPartLonger", L"li", L"", L"LINE LIST "},
    {"LettersBeyondA7", L"über", L"schrift", L""},
    {"GlobalWordsBehindTheMark", L"_", L"", L"_CIRCLE _MTEXT "},
    {"Whole", L"LINE", L"", L""},
    {"None", L"x", L"", L""},
};

std::wstring joined(std::vector<std::wstring> const& words) {
    std::wstring text;
    for (std::wstring const& each : words)
        text += each + L" ";
    return text;
}

class WordCompletion : public testing::TestWithParam<WordCase> {};

TEST_P(WordCompletion, Gives) {
    tzdraft::Completion const seen = tzdraft::completeWord(GetParam().typed, kWords);
    EXPECT_EQ(GetParam().insert, seen.insert);
    EXPECT_EQ(GetParam().choices, joined(seen.choices));
}

INSTANTIATE_TEST_SUITE_P(Words, WordCompletion, testing::ValuesIn(kWordCases), [](auto const& row) {
    return row.param.name;
});

TEST(FileCompletion, GoesDownFoldersAndHidesDots) {
    namespace fs = std::filesystem;
    fs::path const folder = fs::path(testing::TempDir()) / "completion";
    fs::remove_all(folder);
    fs::create_directories(folder / "plans of 1998");
    for (char const* name : {"plan.json", "plans of 1998/a b.json", ".hidden", "Plot.png"})
        std::ofstream(folder / name) << name;
    std::wstring const start = (folder / "").wstring();

    EXPECT_EQ(tzdraft::completeFile(start + L"pl").insert, L"an");
    EXPECT_EQ(joined(tzdraft::completeFile(start + L"plan").choices), L"plan.json plans of 1998/ ");
    EXPECT_EQ(tzdraft::completeFile(start + L"plans").insert, L" of 1998/");
    EXPECT_EQ(tzdraft::completeFile(start + L"plans of 1998/a").insert, L" b.json");
    EXPECT_EQ(tzdraft::completeFile(start).choices.size(), 3u);
    EXPECT_EQ(tzdraft::completeFile(start + L".h").insert, L"idden");
    EXPECT_TRUE(tzdraft::completeFile(start + L"missing/").choices.empty());
}

}  // namespace
