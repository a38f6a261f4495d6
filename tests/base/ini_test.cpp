// INI files: how lines are read, what a change of the file does, and writing.

#include <gtest/gtest.h>

#include <filesystem>

#include "host/files/file_bytes.h"
#include "host/fonts/font_map_path.h"
#include "tz/pal/ini_file.h"

namespace {

// The keys of a section with their values as GetString gives them, and where the walk stops.
class Walk : public CIniFileEnumerator {
public:
    using CIniFileEnumerator::CIniFileEnumerator;
    bool EnumeratedKey(TzString const& key) override {
        seen += key.str() + L'=' + GetString(key, L"").str() + L'|';
        return key != L"stop";
    }
    std::wstring seen;
};

class IniFile : public testing::Test {
protected:
    IniFile() : path_(std::filesystem::temp_directory_path() / "tz-ini-test.ini") {}
    ~IniFile() override { std::filesystem::remove(path_); }

    void write(std::string_view bytes) {
        ASSERT_TRUE(tzhost::writeFileSafely(path_.string(), bytes));
    }
    [[nodiscard]] TzString path() const { return TzString::fromUtf8(path_.string()); }
    [[nodiscard]] std::wstring walk(wchar_t const* section) const {
        Walk walk(path(), section);
        (void)walk.EnumerateSection();  // how it ended shows in what was seen
        return walk.seen;
    }

    std::filesystem::path path_;
};

struct IniRow {
    char const* name;
    char const* bytes;
    wchar_t const* seen;  // of section "A"
};
constexpr IniRow kIniRows[] = {
    {"Plain", "[A]\nk=v\n", L"k=v|"},
    {"FileOrder", "[A]\nz=1\na=2\nm=3\n", L"z=1|a=2|m=3|"},
    {"BlanksAround", "[A]\r\n  k \t= v , w  \r\n", L"k=v , w|"},
    {"BehindTheFirstEquals", "[A]\nk=a=b;c#d\n", L"k=a=b;c#d|"},
    {"CommentsAtTheStartOnly", "[A]\n;k=v\n#j=v\nl=v ; w\n", L"l=v ; w|"},
    {"WrittenTwice", "[A]\nk=1\nx=2\nK=3\n", L"k=3|x=2|K=3|"},
    {"SectionInAnotherCase", "[a]\nk=v\n", L"k=v|"},
    {"SectionInTwoPieces", "[A]\nk=1\n[B]\nk=2\n[A]\nj=3\n", L"k=1|j=3|"},
    {"NoValue", "[A]\ni=1\nk=\nj\n l \n", L"i=1|k=|j=|l=|"},
    {"Bom", "\xEF\xBB\xBF[A]\nk=v\n", L"k=v|"},
    {"Utf8WithoutCase",
     "[A]\nGr\xC3\x96\xC3\x9F"
     "e=\xE6\xBC\xA2\ngr\xC3\xB6\xC3\x9F"
     "e=2\n",
     L"GrÖße=2|größe=2|"},
    {"QuotesStay", "[A]\nk=\"v\"\n", L"k=\"v\"|"},
    {"NoMultiLine", "[A]\nk=<<<X\nj=1\n", L"k=<<<X|j=1|"},
    {"Stops", "[A]\na=1\nstop=2\nz=3\n", L"a=1|stop=2|"},
    {"OtherSection", "[B]\nk=v\n", L""},
    {"Empty", "", L""},
};
class IniReading : public IniFile, public testing::WithParamInterface<IniRow> {};
TEST_P(IniReading, SeesKeysInOrder) {
    write(GetParam().bytes);
    EXPECT_EQ(walk(L"A"), GetParam().seen);
}
INSTANTIATE_TEST_SUITE_P(Forms, IniReading, testing::ValuesIn(kIniRows), [](auto const& row) {
    return row.param.name;
});

TEST_F(IniFile, ShowsAChangeAndKeepsWhatIsOpen) {
    EXPECT_EQ(CIniFile(path(), L"A").GetString(L"k", L"none"), L"none");
    write("[A]\nk=1\n");
    CIniFile const open(path(), L"A");
    EXPECT_EQ(open.GetInt(L"K", 7), 1);
    write("[A]\nk=2\n");
    EXPECT_EQ(CIniFile(path(), L"A").GetInt(L"k", 7), 2);
    EXPECT_EQ(open.GetInt(L"k", 7), 1);
    EXPECT_EQ(open.GetInt(L"j", 7), 7);
    std::filesystem::remove(path_);
    EXPECT_EQ(CIniFile(path(), L"A").GetInt(L"k", 7), 7);
}

TEST_F(IniFile, IsWrittenKeyByKey) {
    write("; kept\n[A]\nk=1\n\n[B]\nj=2\n");
    TzString const file = path();
    EXPECT_TRUE(WritePrivateProfileString(L"A", L"n", L"Größe,1", file));
    EXPECT_TRUE(WritePrivateProfileString(L"A", L"K", L"5", file));
    EXPECT_EQ(walk(L"A"), L"K=5|n=Größe,1|");
    EXPECT_TRUE(WritePrivateProfileString(L"A", L"k", nullptr, file));
    EXPECT_EQ(walk(L"A"), L"n=Größe,1|");
    EXPECT_TRUE(WritePrivateProfileString(L"A", nullptr, nullptr, file));
    EXPECT_EQ(walk(L"A"), L"");
    EXPECT_EQ(walk(L"B"), L"j=2|");
    EXPECT_TRUE(WritePrivateProfileString(L"C", L"new", L"1", file));
    EXPECT_EQ(walk(L"C"), L"new=1|");
    EXPECT_FALSE(WritePrivateProfileString(L"C", L"new", L"1", L"/no/such/folder/file.ini"));
}

TEST(IniNumbers, ReadLeadingDigitsAndWrap) {
    struct Row {
        wchar_t const* text;
        int value;
    };
    for (Row const& row : {Row{L"12", 12},
                           {L" \t-7x", -7},
                           {L"+3", 3},
                           {L"", 0},
                           {L"x1", 0},
                           {L"- 1", 0},
                           {L"2147483648", -2147483647 - 1},
                           {L"4294967297", 1},
                           {L"1.9", 1}}) {
        EXPECT_EQ(ms_wtoi(row.text), row.value) << row.text;
    }
    EXPECT_EQ(ms_wtoi(nullptr), 0);
}

TEST(FontMapFile, IsTheShippedOneUnlessChosen) {
    EXPECT_TRUE(std::filesystem::exists(GetMTextMapFilename().toUtf8()));
    std::string const before = tzhost::setFontMapFile("/tmp/other.ini");
    EXPECT_EQ(GetMTextMapFilename(), L"/tmp/other.ini");
    tzhost::setFontMapFile(before);
}

}  // namespace
