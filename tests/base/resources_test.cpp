// Resource libraries: the table that translators edit, the binary file, and how it is found.

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>

#include "host/base/fault_point.h"
#include "host/files/file_bytes.h"
#include "host/resources/resource_file.h"
#include "host/resources/resource_search.h"
#include "host/resources/resource_table.h"
#include "host/text/text_escapes.h"
#include "tz/rx/resource.h"

namespace {

namespace fs = std::filesystem;

tzhost::ResourceTexts const kTexts{
    {3, L""}, {127, L"TEXTALIGN"}, {1043, L"Größe \x1F600 _Size"}, {0xF039, L"%d found\n"}};

TEST(ResourceFile, GivesBackWhatWasWritten) {
    auto const file = tzhost::ResourceFile::fromBytes(tzhost::writeResourceFile(kTexts));
    ASSERT_TRUE(file);
    EXPECT_EQ(file->all(), kTexts);
    EXPECT_EQ(file->find(1043), L"Größe \x1F600 _Size");
    for (std::uint32_t const id : {0U, 4U, 1044U, 0xFFFFFFFFU})
        EXPECT_FALSE(file->find(id)) << id;
    auto const none = tzhost::ResourceFile::fromBytes(tzhost::writeResourceFile({}));
    ASSERT_TRUE(none);
    EXPECT_FALSE(none->find(0));
}

TEST(ResourceFile, IsRefusedWhenDamagedAnywhere) {
    std::string const whole = tzhost::writeResourceFile(kTexts);
    for (std::size_t i = 0; i < whole.size(); ++i) {
        std::string damaged = whole;
        damaged[i] = static_cast<char>(damaged[i] ^ 0x10);
        EXPECT_FALSE(tzhost::ResourceFile::fromBytes(damaged)) << "byte " << i;
        EXPECT_FALSE(tzhost::ResourceFile::fromBytes(whole.substr(0, i))) << "cut at " << i;
    }
    EXPECT_FALSE(tzhost::ResourceFile::fromBytes(whole + '\0'));
}

struct EscapeRow {
    char const* name;
    std::wstring_view text;
    std::wstring_view line;
};
constexpr EscapeRow kEscapes[] = {
    {"Plain", L"Größe {TEXTSIZE}", L"Größe {TEXTSIZE}"},
    {"LinesAndTabs", L"\na\tb\r", L"\\na\\tb\\r"},
    {"BlanksAtTheEnds", L" a b ", L"\\sa b\\s"},
    {"Backslash", L"\\P", L"\\\\P"},
    {"Control",
     L"\x7"
     L"b\x9D",
     L"\\u0007b\\u009D"},
};
class Escapes : public testing::TestWithParam<EscapeRow> {};
TEST_P(Escapes, GoBothWays) {
    EXPECT_EQ(tzhost::escaped(GetParam().text), GetParam().line);
    EXPECT_EQ(tzhost::unescaped(GetParam().line), GetParam().text);
}
INSTANTIATE_TEST_SUITE_P(Forms, Escapes, testing::ValuesIn(kEscapes), [](auto const& row) {
    return row.param.name;
});

TEST(EscapesOfTables, AreRefusedWhenUnknown) {
    for (wchar_t const* const line : {L"\\", L"a\\q", L"\\u12", L"\\u12G4"}) {
        EXPECT_FALSE(tzhost::unescaped(line)) << line;
    }
}

struct TableRow {
    char const* name;
    char const* original;
    char const* translation;  // null: the original is checked alone
    char const* fault;        // empty: none
};
constexpr TableRow kTables[] = {
    {"Clean", "# c\n\n[keywords]\n1\tJustify _Justify\r\n[texts]\n0x2\t%s of %d%%", nullptr, ""},
    {"NoTab", "1 text", nullptr, "o:1: expected an id, a tab and a text"},
    {"BadId", "x1\ttext", nullptr, "o:1: expected an id, a tab and a text"},
    {"BadEscape", "\n1\t\\q", nullptr, "o:2: a backslash opens no escape"},
    {"NotUtf8", "1\t\xC3", nullptr, "o:1: the text is not UTF-8"},
    {"UnknownSection", "[text]", nullptr, "o:1: no such section: [text]"},
    {"TwiceTheId", "1\ta\n0x1\tb", nullptr, "o:2: the id 1 stands in line 1 too"},
    {"StrayPercent", "1\t50% of", nullptr, "o:1: a percent sign opens no conversion"},
    {"PercentAtTheEnd", "1\t50%", nullptr, "o:1: a percent sign opens no conversion"},
    {"KeywordUnsplit", "[keywords]\n1\tJustify", nullptr, "o:2: the keyword has no \" _\""},
    {"KeywordHalf", "[keywords]\n1\tJustify _", nullptr,
     "o:2: the keyword lacks a local or global text"},
    {"KeywordThrice", "[keywords]\n1\ta _b _c", nullptr, "o:2: the keyword has two \" _\""},
    {"WarningWithPercent", "[warnings]\n1\t100%%", nullptr,
     "o:2: a warning text has a percent sign"},
    {"WarningFormatDoubled", "[warning formats]\n1\t%d%%", nullptr,
     "o:2: a warning format has a percent sign that is no %d"},
    {"Missing", "1\ta\n2\tb", "1\ta", "t: the id 2 is missing"},
    {"Extra", "1\ta", "1\ta\n2\tb", "t:2: the original has no id 2"},
    {"Turned", "1\t%s %d", "1\t%d %s", "t:1: other conversions than the original has"},
    {"WideIsTheSame", "1\t%s %.3f", "1\t%ls %8f", ""},
    {"OtherGlobal", "[keywords]\n1\ta _A", "[keywords]\n1\tb _B",
     "t:2: another global text than the original's"},
    {"OtherLocal", "[keywords]\n1\ta _A", "[keywords]\n1\tb _A", ""},
    {"FixedChanged", "[fixed]\n1\ta", "[fixed]\n1\tb",
     "t:2: differs from the original, and may not"},
};
class Tables : public testing::TestWithParam<TableRow> {};
TEST_P(Tables, AreChecked) {
    tzhost::ResourceFaults faults;
    auto const original = tzhost::readResourceTable("o", GetParam().original, faults);
    tzhost::checkResourceTable(original, faults);
    if (GetParam().translation != nullptr) {
        auto const other = tzhost::readResourceTable("t", GetParam().translation, faults);
        tzhost::checkTranslation(original, other, faults);
    }
    EXPECT_EQ(faults.empty() ? "" : faults[0], GetParam().fault);
}
INSTANTIATE_TEST_SUITE_P(Faults, Tables, testing::ValuesIn(kTables), [](auto const& row) {
    return row.param.name;
});

TEST(ResourceTable, IsReadAsItWasWritten) {
    tzhost::ResourceFaults faults;
    auto const table = tzhost::readResourceTable("o", tzhost::writeResourceTable(kTexts), faults);
    EXPECT_TRUE(faults.empty());
    EXPECT_EQ(table.texts(), kTexts);
}

// A folder with an English and a German library.
class ResourceInstance : public testing::Test {
protected:
    ResourceInstance() : folder_(fs::temp_directory_path() / "tz-resources-test") {
        fs::create_directories(folder_ / "de");
        put(folder_ / "Texts.dll", L"Yes");
        put(folder_ / "de" / "Texts.dll", L"Ja");
        before_ = tzhost::setResourceSearch({folder_.string(), "", ""});
    }
    ~ResourceInstance() override {
        tzhost::setResourceSearch(before_);
        fs::remove_all(folder_);
    }

    static void put(fs::path const& file, wchar_t const* text) {
        ASSERT_TRUE(tzhost::writeFileSafely(file.string(), tzhost::writeResourceFile({{1, text}})));
    }
    static TzString textOf(TzRxResourceInstance const& instance) {
        TzString text = L"untouched";
        EXPECT_EQ(instance.tryLoadString(1, text), instance.isLoaded());
        return text;
    }

    fs::path folder_;

private:
    tzhost::ResourceSearch before_;
};

TEST_F(ResourceInstance, IsFoundByLanguage) {
    struct Row {
        char const* locale;
        wchar_t const* text;
    };
    for (Row const& row : {Row{"", L"Yes"},
                           {"en", L"Yes"},
                           {"de", L"Ja"},
                           {"de_AT.UTF-8", L"Ja"},
                           {"fr", L"Yes"},
                           {"../de", L"Yes"}}) {
        tzhost::setResourceSearch({folder_.string(), row.locale, ""});
        EXPECT_EQ(textOf(TzRxResourceInstance(L"Texts.dll")), row.text) << row.locale;
    }
    tzhost::setResourceSearch({"", "", (folder_ / "de" / "Texts.dll").string()});
    EXPECT_EQ(textOf(TzRxResourceInstance(L"Any.dll")), L"Ja");
}

TEST_F(ResourceInstance, IsNotLoadedFromAMissingOrDamagedFile) {
    EXPECT_EQ(textOf(TzRxResourceInstance(L"None.dll")), L"untouched");
    EXPECT_EQ(textOf(TzRxResourceInstance::empty), L"untouched");
    ASSERT_TRUE(tzhost::writeFileSafely((folder_ / "de" / "Texts.dll").string(), "TZRS"));
    tzhost::setResourceSearch({folder_.string(), "de", ""});
    EXPECT_EQ(textOf(TzRxResourceInstance(L"Texts.dll")), L"untouched");
}

}  // namespace
