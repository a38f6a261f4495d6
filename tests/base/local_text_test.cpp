// The host's texts in another language: what a table may hold, and what is shown.

#include <gtest/gtest.h>

#include "host/resources/language.h"
#include "host/text/local_text.h"

namespace {

// English again at the end.
class LocalTexts : public testing::Test {
protected:
    ~LocalTexts() override { tzhost::setLocalTexts({}); }

    std::vector<std::string> use(std::string_view table) {
        std::vector<std::string> faults;
        tzhost::setLocalTexts(tzhost::readLocalTexts(table, faults));
        return faults;
    }
};

TEST_F(LocalTexts, AreShownWhereTheTableHasThem) {
    EXPECT_TRUE(
        use("# Deutsch\n\nYes\tJa\nSelect:\\s\tWählen:\\s\n\\nNone.\\n\t\\nKeins.\\n").empty());
    EXPECT_STREQ(tzhost::localText(L"Yes"), L"Ja");
    EXPECT_STREQ(tzhost::localText(L"Select: "), L"W\u00E4hlen: ");
    EXPECT_STREQ(tzhost::localText(L"\nNone.\n"), L"\nKeins.\n");
    EXPECT_EQ(tzhost::localText("Select: "), "W\u00E4hlen: ");
    EXPECT_STREQ(tzhost::localText(L"No"), L"No");
    EXPECT_STREQ(tzhost::localText(L""), L"");
    use("");
    EXPECT_STREQ(tzhost::localText(L"Yes"), L"Yes");
}

struct FaultRow {
    char const* name;
    std::string_view table;
    char const* fault;
};
constexpr FaultRow kFaults[] = {
    {"NoTab", "Yes Ja\n", "1: expected a text, a tab and its translation"},
    {"NotUtf8", "Yes\tJ\xE4\n", "1: the line is not UTF-8"},
    {"NoEscape", "Yes\t\\q\n", "1: a backslash opens no escape"},
    {"Empty", "Yes\t\n", "1: a text is empty"},
    {"Twice", "Yes\tJa\nNo\tJ\nYes\tJo", "3: stands in line 1 too"},
    {"OtherConversion", "#\n%d found\t%ls gefunden", "2: the conversions differ"},
    {"MoreConversions", "found\t%n gefunden", "1: the conversions differ"},
    {"OrderChanged", "%ls at %d\tbei %d: %ls", "1: the conversions differ"},
};

// A text with a fault is shown in English: a format would take the wrong arguments.
TEST_F(LocalTexts, WithFaultsAreLeftOut) {
    for (FaultRow const& row : kFaults) {
        std::vector<std::string> const faults = use(row.table);
        ASSERT_EQ(faults.size(), 1U) << row.name;
        EXPECT_EQ(faults[0], row.fault) << row.name;
        EXPECT_STREQ(tzhost::localText(L"found"), L"found") << row.name;
        EXPECT_STREQ(tzhost::localText(L"%d found"), L"%d found") << row.name;
    }
}

TEST(Languages, EnglishIsNone) {
    for (char const* const english : {"", "C", "C.UTF-8", "POSIX", "en", "en_GB.UTF-8", "en-US"})
        EXPECT_TRUE(tzhost::isEnglish(english)) << english;
    for (char const* const other : {"de", "de_AT.UTF-8@euro", "eng", "c", "..", "/en"})
        EXPECT_FALSE(tzhost::isEnglish(other)) << other;
}

}  // namespace
