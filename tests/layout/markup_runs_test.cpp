#include <gtest/gtest.h>

#include <cstdlib>
#include <string>

#include "tests/layout/markup_runs.h"

namespace {

using namespace tzhost;
using namespace tztest;

MarkupFormat const kInitial{0, 1.0, {}, false, false};

TEST(MarkupRuns, ReadAsTheTableSays) {
    char const* const source = std::getenv("TZ_TEST_SOURCE");
    ASSERT_NE(source, nullptr);
    auto const cases = readRunsFile(std::string(source) + "/tests/layout/runs.txt");
    ASSERT_GT(cases.size(), 60U);
    for (RunsCase const& row : cases) {
        EXPECT_EQ(printRuns(readMarkup(row.markup, kInitial), kInitial), row.runs)
            << "runs.txt:" << row.line << ": " << row.name;
    }
}

TEST(MarkupRuns, ZeroEndsTheText) {
    std::wstring const text(L"A\0B", 3);
    EXPECT_EQ(printRuns(readMarkup(text, kInitial), kInitial), "'A' P");
}

// Letters of no height cannot be shown, so this reader passes such heights over.
TEST(MarkupRuns, HeightsAreAboveZero) {
    EXPECT_EQ(printRuns(readMarkup(L"\\H-2;A\\H0;B\\Hx;C", kInitial), kInitial), "'ABC' P");
}

std::wstring repeated(std::wstring const& part, int count) {
    std::wstring text;
    for (int i = 0; i < count; ++i)
        text += part;
    return text;
}

// Texts for which a careless reader would need quadratic time or the whole call stack.
TEST(MarkupRuns, HostileTextsAreReadInLinearTime) {
    constexpr int kCount = 200000;
    EXPECT_EQ(
        printRuns(readMarkup(repeated(L"{", kCount) + repeated(L"}", kCount) + L"A", kInitial),
                  kInitial),
        "'A' P");
    EXPECT_EQ(readMarkup(repeated(L"{\\C1;a", kCount), kInitial).text.size(), 200000U);
    // Stacks without an end: without a sign, with a sign that a code hides, and "\S" alone.
    EXPECT_EQ(readMarkup(repeated(L"\\Sx", kCount), kInitial).text.size(), 600000U);
    EXPECT_EQ(readMarkup(repeated(L"\\S\\U+002F", 100000), kInitial).text.size(), 300000U);
    EXPECT_EQ(readMarkup(repeated(L"\\S", kCount), kInitial).text.size(), 400000U);
}

}  // namespace
