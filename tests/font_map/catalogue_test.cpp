// The catalogue's own operations, on tables and a registry that the tests fill.

#include <gtest/gtest.h>

#include <cwchar>
#include <filesystem>
#include <fstream>
#include <iterator>

#include "host/settings/settings.h"
#include "module/fonts/font_locations.h"
#include "tz/mte/font_map_catalogue.h"

namespace {

class Catalogue : public testing::Test {
protected:
    Catalogue() {
        database_.ResetContents();
        auto* const file = new CTzadFileToFontMapEntry;
        file->m_bItalic = true;
        file->m_logFont.lfCharSet = 204;
        file->m_logFont.lfPitchAndFamily = 34;
        std::wcscpy(file->m_logFont.lfFaceName, L"Some Face");
        CTzadFontMapDatabase::m_mapFileToFont[L"some.ttf"] = file;
        auto* const face = new CTzadFontToFileMapEntry;
        face->m_sRegular = L"some.ttf";
        face->m_sBold = L"someb.ttf";
        CTzadFontMapDatabase::m_mapFontToFile[L"some face"] = face;
    }
    ~Catalogue() override {
        CTzadFontMapDatabase::m_sRegistryLocation.setEmpty();
        database_.ResetContents();
        tzhost::settings() = tzhost::Settings();
    }
    CTzadFontMapDatabase database_{0};
};

TEST_F(Catalogue, MapsBothWays) {
    bool bold = true;
    bool italic = false;
    int charset = 1;
    int family = 1;
    EXPECT_EQ(database_.MapFileToFont(L"SOME.ttf", bold, italic, charset, family), L"Some Face");
    EXPECT_EQ((std::vector<int>{bold, italic, charset, family}), (std::vector<int>{0, 1, 204, 34}));
    EXPECT_EQ(database_.MapFileToFont(L"other.ttf", bold, italic, charset, family), L"");
    EXPECT_EQ((std::vector<int>{bold, italic, charset, family}), (std::vector<int>{0, 0, 0, 0}));
    EXPECT_EQ(database_.MapFontToFile(L"@SOME Face", false, false, 9, 9), L"some.ttf");
    EXPECT_EQ(database_.MapFontToFile(L"some face", true, false, 0, 0), L"someb.ttf");
    EXPECT_EQ(database_.MapFontToFile(L"some face", true, true, 0, 0), L"");
    EXPECT_EQ(database_.MapFontToFile(L"other", false, false, 0, 0), L"");
}

TEST_F(Catalogue, TellsWhichFormsAreSynthesised) {
    bool bold = true;
    bool both = false;
    EXPECT_TRUE(database_.GetFontSynthesisInfo(L"Some FACE", &bold, nullptr, &both));
    EXPECT_FALSE(bold);
    EXPECT_TRUE(both);
    EXPECT_FALSE(database_.GetFontSynthesisInfo(L"other", &bold, nullptr, &both));
    EXPECT_TRUE(both);  // left alone
}

TEST_F(Catalogue, DumpsItsTables) {
    auto const file = std::filesystem::path(std::getenv("TZ_TEST_SCRATCH")) / "dump.ini";
    std::ofstream(file) << "[Files to Fonts]\nold=1\n[Fonts to Files]\nold=1\n";
    std::wstring const name = file.wstring();
    database_.WriteFontToFileMapToDisk(name.c_str(), 1);
    database_.WriteFileToFontMapToDisk(name.c_str(), 0);
    auto const contents = [&file] {
        std::ifstream in(file);
        return std::string{std::istreambuf_iterator<char>(in), {}};
    };
    std::string const text = contents();
    auto const has = [&](char const* line) { return text.find(line) != std::string::npos; };
    EXPECT_TRUE(has("some face")) << text;
    EXPECT_TRUE(has("some.ttf,someb.ttf,,")) << text;
    EXPECT_TRUE(has("Some Face [B0 I1 F34 C204]")) << text;
    EXPECT_EQ(text.find("old"), text.rfind("old"))
        << text;  // the section that was not appended to is new
    database_.WriteDatabaseToDisk(name.c_str(), 0);
    EXPECT_EQ(contents().find("old"), std::string::npos);
    EXPECT_LT(contents().find("some.ttf,"), contents().find("[B0 I1"));
}

TEST_F(Catalogue, LearnsTheFontFolderOnce) {
    auto& folders = tzhost::settings().registry[L"hkey_current_user\\software\\microsoft\\windows\\"
                                                L"currentversion\\explorer\\shell folders"];
    folders = {{L"Fonts", L"C:\\Windows\\Fonts"}};
    CTzadFontMapDatabase::InitSystemLocations();
    EXPECT_EQ(CTzadFontMapDatabase::GetSystemFontPath(), L"C:\\Windows\\Fonts");
    folders = {{L"Fonts", L"D:\\Fonts"}};
    CTzadFontMapDatabase::PopulateDatabaseFromRegistry();
    EXPECT_EQ(CTzadFontMapDatabase::GetSystemFontPath(), L"C:\\Windows\\Fonts");
}

TEST_F(Catalogue, FindsFilesInTheRegistry) {
    std::wstring const fonts =
        L"hkey_local_machine\\software\\microsoft\\windows nt\\currentversion\\fonts";
    tzhost::settings().registry[fonts] = {
        {L"Plain Face", L"plain.fot"},
        {L"Number", std::uint32_t{5}},
        {L"Alone One (All)", L"alone.ttc"},
        {L"First & Second Face & Third (TrueType)", L"set.ttc"},
        {L"Short", L".fot"},
        {L"Five", L"X.FOT"},
        {L"Numbers & Letters (TrueType)", std::uint32_t{5}},
        {L"Others & Letters (TrueType)", L"letters.ttc"},
    };
    tzhost::settings().registry[L"hkey_local_machine\\software\\product\\altfontnames"] = {
        {L"Alternate", L"alternate.ttf"}};
    tzhost::settings().productKey = L"SOFTWARE\\Product";
    CTzadFontMapDatabase::PopulateDatabaseFromRegistry();
    // The walk closes both lists again, so that nothing is found after it.
    EXPECT_EQ(CTzadFontMapDatabase::GetFileNameFromFaceName(L"Plain Face"), L"");
    ASSERT_TRUE(regLocation().Open(HKEY_LOCAL_MACHINE, CTzadFontMapDatabase::m_sRegistryLocation));
    ASSERT_TRUE(regLocationAlt().Open(HKEY_LOCAL_MACHINE, L"SOFTWARE\\Product\\AltFontNames"));
    struct Row {
        wchar_t const* face;
        wchar_t const* file;
    };
    for (Row const& row : {Row{L"Plain Face", L"plain.ttf"}, Row{L"@Plain Face", L"plain.ttf"},
                           Row{L"Alternate", L"alternate.ttf"}, Row{L"First", L"set.ttc"},
                           Row{L"Second Face (Any)", L"set.ttc"}, Row{L"Third", L"set.ttc"},
                           Row{L"Second", L"set.ttc"}, Row{L"Alone One", L""}, Row{L"Number", L""},
                           Row{L"Short", L".fot"}, Row{L"Five", L"X.ttf"},
                           Row{L"Letters", L"letters.ttc"}, Row{L"Missing", L""}}) {
        EXPECT_EQ(CTzadFontMapDatabase::GetFileNameFromFaceName(row.face), row.file) << row.face;
    }
    regLocation().Close();
    regLocationAlt().Close();
    EXPECT_EQ(CTzadFontMapDatabase::m_sRegistryLocation,
              L"SOFTWARE\\Microsoft\\Windows NT\\CurrentVersion\\Fonts");
    EXPECT_EQ(CTzadFontMapDatabase::GetFaceNameFromFontName(L"any", true, true), L"");
}

}  // namespace
