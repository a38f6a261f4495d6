// The settings file, and what modules see of it.

#include <gtest/gtest.h>

#include <filesystem>

#include "host/files/file_bytes.h"
#include "host/settings/settings.h"
#include "host/settings/variables.h"
#include "tz/pal/registry.h"
#include "tz/pal/settings.h"

namespace {

namespace fs = std::filesystem;
using tzhost::KeptIn;
using tzhost::Variables;

struct FaultRow {
    char const* name;
    char const* document;
    char const* error;  // empty: none
};
constexpr FaultRow kFaults[] = {
    {"Empty", "{}", ""},
    {"AllMembers",
     R"({"variables": {"MTEXTED": "vi", "attipe": 1, "SYSCODEPAGE": "ANSI_932"},
         "product": {"MTEXT.IPE": {"MinPixelSize": 4294967295}},
         "registry": {"HKEY_CURRENT_USER": {"a": 5, "b": "text"}, "HKEY_LOCAL_MACHINE\\X\\": {}},
         "productKey": "K", "denied": ["FIELD"], "fabric": true, "inPlaceEditors": ["a", "b"],
         "rtfEditor": "r", "textEditor": "t"})",
     ""},
    {"NoObject", "[]", "1: expected an object"},
    {"Unknown", "{\n\"colour\": 1}", "2: colour: there is no such setting"},
    {"WrongType", "{\"productKey\":\n 1\n}", "2: productKey: expected a text"},
    {"WrongItem", "{\"denied\": [\"A\",\n2]}", "2: denied: expected a text"},
    {"NoBoolean", "{\"fabric\": \"yes\"}", "1: fabric: expected true or false"},
    {"UnknownVariable", "{\"variables\": {\n\n\"NOSUCH\": 1}}",
     "3: variables.NOSUCH: there is no such system variable"},
    {"DrawingVariable", "{\"variables\": {\"LUNITS\": 1}}",
     "1: variables.LUNITS: is not kept in the settings"},
    {"VariableTwice", "{\"variables\": {\"DIALOGS\": 1, \"dialogs\": 0}}",
     "1: variables.dialogs: stands twice, expected each member once"},
    {"VariableOutOfRange", "{\"variables\": {\"DIALOGS\": 2}}",
     "1: variables.DIALOGS: takes a whole number from 0 to 1"},
    {"VariableOfAnotherType", "{\"variables\": {\"DIALOGS\": \"1\"}}",
     "1: variables.DIALOGS: takes a whole number from 0 to 1"},
    {"VariableIsNoText", "{\"variables\": {\"MTEXTED\": null}}",
     "1: variables.MTEXTED: takes a text"},
    {"NegativeSize", "{\"product\": {\"P\": {\"N\": -1}}}",
     "1: product.P.N: expected a whole number from 0 to 4294967295"},
    {"LargeSize", "{\"product\": {\"P\": {\"N\": 4294967296}}}",
     "1: product.P.N: expected a whole number from 0 to 4294967295"},
    {"FractionInRegistry", "{\"registry\": {\"HKEY_CURRENT_USER\": {\"N\": 1.5}}}",
     "1: registry.HKEY_CURRENT_USER.N: expected a whole number from 0 to 4294967295"},
    {"UnknownRoot", "{\"registry\": {\"HKEY_USERS\\\\A\": {}}}",
     "1: registry.HKEY_USERS\\A: expected HKEY_CURRENT_USER or HKEY_LOCAL_MACHINE first"},
    {"Twice", "{\"fabric\": true,\n\"fabric\": true}",
     "2: fabric: stands twice, expected each member once"},
    {"NotUtf8", "{\"productKey\": \"\xFF\"}", "1: the byte at offset 16 is no UTF-8"},
};
class SettingsFile : public testing::TestWithParam<FaultRow> {};
TEST_P(SettingsFile, IsChecked) {
    EXPECT_EQ(tzhost::readSettings(GetParam().document).error, GetParam().error);
}
INSTANTIATE_TEST_SUITE_P(Faults, SettingsFile, testing::ValuesIn(kFaults), [](auto const& row) {
    return row.param.name;
});

TEST(SettingsDocument, ThatIsNoJsonIsRefusedWithItsLine) {
    for (char const* const text : {"{\n\"fabric\": tru\n}", "{\n\"fabric\" true}",
                                   "{\n\"fabric\": 1e999}", "{\n\"fabric\": true,}"}) {
        EXPECT_EQ(tzhost::readSettings(text).error.substr(0, 3), "2: ") << text;
    }
    EXPECT_FALSE(tzhost::readSettings("").error.empty());
    EXPECT_EQ(tzhost::readSettings(std::string(100000, '[')).error,
              "1: is nested too deeply, expected at most 200 levels");
}

// A settings file of its own, and defaults again afterwards.
class LoadedSettings : public testing::Test {
protected:
    LoadedSettings() : folder_(fs::temp_directory_path() / "tz-settings-test") {}
    ~LoadedSettings() override {
        fs::remove_all(folder_);
        tzhost::settings() = {};
        store_.resetKept(KeptIn::user);
    }

    void load(std::string_view document) {
        fs::create_directories(folder_);
        ASSERT_TRUE(tzhost::writeFileSafely(file(), document));
        EXPECT_EQ(tzhost::loadSettings(file(), tzhost::IfMissing::fail), std::nullopt);
    }
    [[nodiscard]] std::string file() const { return (folder_ / "settings.json").string(); }

    fs::path folder_;
    Variables& store_ = Variables::instance();
};

TEST_F(LoadedSettings, GiveModulesTheirProductValues) {
    namespace Pal = Tzworks::Tzdraft::PAL;
    load(R"({"product": {"MTEXT.IPE": {"MinPixelSize": 9}}, "fabric": true, "denied": ["Field"]})");
    auto const reader = [](Pal::Settings::Container const& values) {
        return values.exists(L"minpixelsize") && !values.exists(L"FixedPixelSize") &&
               values.getUInt32(L"MinPixelSize") == 9 && values.getUInt32(L"FixedPixelSize") == 0;
    };
    EXPECT_TRUE(Pal::Settings::read().getProductSettings(L"MTEXT.IPE", reader, true));
    EXPECT_FALSE(Pal::Settings::read().getProductSettings(L"MTEXT.IPE", reader, false));
    EXPECT_FALSE(Pal::Settings::read().getProductSettings(L"OTHER", reader, true));
    EXPECT_TRUE(Pal::Process::isFabric());
    EXPECT_FALSE(IsCommandAllowed(L"GJFME"));
    EXPECT_TRUE(IsCommandAllowed(L"NUFYU"));
}

TEST_F(LoadedSettings, AreARegistry) {
    load(R"({"registry": {"HKEY_CURRENT_USER": {"Top": 1},
                          "HKEY_LOCAL_MACHINE\\Soft\\Fonts": {"Arial": "arial.ttf", "Size": 20}}})");
    CTwUiRegistryAccess keys;
    EXPECT_FALSE(keys.IsOpen());
    std::uint32_t value = 7;
    std::uint32_t type = 0;
    ASSERT_TRUE(keys.Open(HKEY_CURRENT_USER, L""));
    EXPECT_TRUE(keys.GetDword(L"TOP", value, type));
    EXPECT_EQ(value, 1U);
    EXPECT_EQ(type, REG_DWORD);
    EXPECT_TRUE(keys.Open(HKEY_LOCAL_MACHINE, L"SOFT"));  // a key above another
    EXPECT_FALSE(keys.Open(HKEY_LOCAL_MACHINE, L"Sof"));
    EXPECT_FALSE(keys.IsOpen());
    ASSERT_TRUE(keys.Open(HKEY_LOCAL_MACHINE, L"Soft\\fonts"));
    EXPECT_EQ(keys.GetString(L"arial"), L"arial.ttf");
    EXPECT_EQ(keys.GetString(L"Size"), L"");
    EXPECT_TRUE(keys.GetDword(L"Arial", value, type));
    EXPECT_EQ(type, REG_SZ);
    EXPECT_EQ(value, 1U);
    EXPECT_FALSE(keys.GetDword(L"None", value, type));
    TzString name;
    EXPECT_TRUE(keys.EnumValueNames(1, name, type));
    EXPECT_EQ(name, L"Size");
    EXPECT_FALSE(keys.EnumValueNames(2, name, type));
    keys.Close();
    EXPECT_FALSE(keys.EnumValueNames(0, name, type));
}

TEST_F(LoadedSettings, GetTheirVariablesBackAndNothingElse) {
    load("{\"denied\": [\"X\"], \"variables\": {\"MTEXTED\": \"vi\", \"DIALOGS\": 1}}");
    EXPECT_EQ(store_.text(L"MTEXTED"), L"vi");
    ASSERT_TRUE(store_.setFromText(L"ATTIPE", L"1", tzhost::Writer::user).isDone());
    ASSERT_TRUE(store_.setFromText(L"MTEXTED", L"Internal", tzhost::Writer::user).isDone());
    ASSERT_TRUE(store_.overrideFromText(L"CURSORTYPE", L"1").isDone());
    EXPECT_EQ(tzhost::saveUserVariables(file()), std::nullopt);
    EXPECT_EQ(tzhost::readFile(file()), "{\n  \"denied\": [\n    \"X\"\n  ],\n  \"variables\": {\n"
                                        "    \"MTEXTED\": \"Internal\",\n    \"DIALOGS\": 1,\n"
                                        "    \"ATTIPE\": 1\n  }\n}\n");
    ASSERT_TRUE(store_.setFromText(L"CURSORTYPE", L"0", tzhost::Writer::user).isDone());
}

TEST_F(LoadedSettings, AreNotWrittenWithoutNeed) {
    EXPECT_EQ(tzhost::loadSettings(file(), tzhost::IfMissing::useDefaults), std::nullopt);
    EXPECT_TRUE(tzhost::loadSettings(file(), tzhost::IfMissing::fail));
    EXPECT_EQ(tzhost::saveUserVariables(file()), std::nullopt);
    EXPECT_FALSE(fs::exists(file()));
    ASSERT_TRUE(store_.setFromText(L"ATTIPE", L"1", tzhost::Writer::user).isDone());
    EXPECT_EQ(tzhost::saveUserVariables(file()), std::nullopt);
    EXPECT_TRUE(fs::exists(file()));
    ASSERT_TRUE(tzhost::writeFileSafely(file(), "no settings"));
    EXPECT_TRUE(tzhost::saveUserVariables(file()));
    EXPECT_EQ(tzhost::readFile(file()), "no settings");
}

}  // namespace
