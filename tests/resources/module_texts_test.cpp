// The texts of the shipped library: all there, formats that fit their arguments, keywords that a
// user can tell apart. TZ_TEST_LANGUAGE names another language than English.

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <set>

#include "host/command_line/keyword_list.h"
#include "host/resources/resource_search.h"
#include "module/prompt/input.h"
#include "module/texts/resources.h"
#include "module/texts/string_table.h"
#include "tests/resources/texts_in_code.h"

namespace {

// Before the first text is read: the library is kept for the life of the process.
[[maybe_unused]] bool const isLanguageChosen = [] {
    char const* const language = std::getenv("TZ_TEST_LANGUAGE");
    tzhost::setResourceSearch({"", language ? language : "", ""});
    return true;
}();

TEST(ModuleTexts, AreThoseOfTheLanguage) {
    bool const isEnglish = std::getenv("TZ_TEST_LANGUAGE") == nullptr;
    EXPECT_EQ(loadResourceString(1101) == L"Yes", isEnglish);
}

TEST(ModuleTexts, FormatTheirArguments) {
    wchar_t const* const a = L"A";
    wchar_t const* const b = L"B";
    wchar_t const* const c = L"C";
    wchar_t const* const d = L"D";
    for (int id : {1064, 1078})
        EXPECT_NE(TzString::formatted(loadResourceString(id), a, b, c).find(L"C"), -1) << id;
    for (int id : {1077, 57689})
        EXPECT_NE(TzString::formatted(loadResourceString(id), a, b).find(L"B"), -1) << id;
    for (int id : {1079, 1081, 57664, 57671, 57690})
        EXPECT_NE(TzString::formatted(loadResourceString(id), a).find(L"A"), -1) << id;
    for (int id : {1094, 57697, 0x8A03, 0xF039, 0xDA9B})
        EXPECT_NE(TzString::formatted(loadResourceString(id), 77).find(L"77"), -1) << id;
    for (int id : {57691, 57694})
        EXPECT_NE(TzString::formatted(loadResourceString(id), 2.5).find(L"2.5"), -1) << id;
    EXPECT_NE(TzString::formatted(loadResourceString(1096), a, b, c, d).find(L"(Dx)"), -1);
}

TEST(ModuleTexts, HoldTheFixedOnes) {
    EXPECT_EQ(loadResourceString(0x8009), L"Internal");
    EXPECT_EQ(loadResourceString(1068), L"?");
    wchar_t const* const kDashesAndQuotes[] = {L"\u2014", L"\u2013", L"\u2018",
                                               L"\u2019", L"\u201C", L"\u201D"};
    for (int index = 0; index < 6; ++index)
        EXPECT_EQ(loadResourceString(1033 + index), kDashesAndQuotes[index]);
}

// A question's keywords: their ids in the order of the prompt and the global words.
struct QuestionRow {
    char const* name;
    std::vector<unsigned int> ids;
    std::vector<wchar_t const*> globals;
};
QuestionRow const kQuestions[] = {
    {"SecondCorner",
     {1046, 1043, 1083, 1044, 1045, 1059, 1104},
     {L"Height", L"Justify", L"Linespacing", L"Rotation", L"Style", L"Width", L"Columns"}},
    {"Attachment",
     {1048, 1049, 1050, 1051, 1052, 1053, 1054, 1055, 1056},
     {L"TL", L"TC", L"TR", L"ML", L"MC", L"MR", L"BL", L"BC", L"BR"}},
    {"LineSpacing", {1084, 1085}, {L"Atleast", L"Exactly"}},
    {"Columns", {1107, 1106, 1108}, {L"Dynamic", L"Static", L"Nocolumns"}},
    // These hold all words of a question in one text.
    {"AlignSelection", {57663}, {L"alIgnment", L"Options"}},
    {"AlignDirection",
     {57665},
     {L"Left", L"Center", L"Right", L"TL", L"TC", L"TR", L"ML", L"MC", L"MR", L"BL", L"BC", L"BR"}},
    {"AlignFirstPoint", {57667}, {L"Point"}},
    {"AlignSecondPoint", {57670}, {L"Options"}},
    {"AlignSpacing", {57672}, {L"Distribute", L"Set", L"Horizontal", L"Vertical"}},
};

std::wstring listOf(std::vector<unsigned int> const& ids) {
    class Question : public CTzsInput {
    public:
        using CTzsInput::CTzsInput;
        TzString PromptString() const override { return CTzsInput::PromptString(); }
        int OnPrompt(TzString const&) override { return statusNone; }
    };
    if (ids.size() == 1) return loadResourceString(static_cast<int>(ids[0])).str();
    CKeywordTable table(ids.data(), static_cast<int>(ids.size()));
    return Question(0, table, L"").KeywordList().str();
}

std::wstring capitalsOf(std::wstring const& word) {
    std::wstring capitals;
    std::copy_if(word.begin(), word.end(), std::back_inserter(capitals),
                 [](wchar_t c) { return tzToLower(c) != c; });
    return capitals;
}

std::wstring lowered(std::wstring word) {
    std::transform(word.begin(), word.end(), word.begin(), tzToLower);
    return word;
}

class Keywords : public testing::TestWithParam<QuestionRow> {};
TEST_P(Keywords, AreToldApartByWordAndAbbreviation) {
    QuestionRow const& row = GetParam();
    auto const words = tzhost::KeywordList::parse(listOf(row.ids));
    ASSERT_TRUE(words.has_value());
    ASSERT_EQ(words->count(), static_cast<int>(row.globals.size()));
    std::set<std::wstring> abbreviations;
    for (int index = 0; index < words->count(); ++index) {
        std::wstring const& local = words->local(index);
        EXPECT_EQ(words->global(index), row.globals[static_cast<std::size_t>(index)]);
        EXPECT_EQ(words->match(local), index);
        EXPECT_EQ(words->match(capitalsOf(local)), index);
        EXPECT_EQ(words->match(lowered(local)), index);
        EXPECT_EQ(words->match(L"_" + words->global(index)), index);
        EXPECT_EQ(words->match(L"_" + capitalsOf(words->global(index))), index);
        EXPECT_FALSE(capitalsOf(local).empty());
        EXPECT_TRUE(abbreviations.insert(capitalsOf(local)).second) << "two words abbreviate alike";
    }
}
INSTANTIATE_TEST_SUITE_P(Questions, Keywords, testing::ValuesIn(kQuestions), [](auto const& row) {
    return row.param.name;
});

// The words that a prompt of the host's own kind shows are those that it takes.
TEST(ModuleTexts, ShowTheKeywordsThatTheyTake) {
    struct Row {
        int prompt;
        int keywords;
    };
    for (Row const& row :
         {Row{57662, 57663}, {57664, 57665}, {57666, 57667}, {57669, 57670}, {57671, 57672}}) {
        auto const words = tzhost::KeywordList::parse(loadResourceString(row.keywords).str());
        ASSERT_TRUE(words.has_value()) << row.keywords;
        std::wstring shown = L"[";
        for (int index = 0; index < words->count(); ++index)
            shown += words->local(index) + (index + 1 < words->count() ? L"/" : L"]");
        EXPECT_NE(loadResourceString(row.prompt).find(shown.c_str()), -1) << row.prompt;
    }
}

}  // namespace
