// Settings that nobody named and drawings of others: what they may decide, and what happens to a
// settings file that cannot be used.

#include <gtest/gtest.h>

#include <cstdlib>

#include "tests/support/program_run.h"

namespace {

namespace fs = std::filesystem;
using tztest::scratch;

// The configuration folder of one test.
class Configuration {
public:
    Configuration() {
        fs::remove_all(folder_);
        fs::create_directories(folder_ / "tzdraft");
        setenv("XDG_CONFIG_HOME", folder_.c_str(), 1);
    }
    Configuration(Configuration const&) = delete;
    Configuration& operator=(Configuration const&) = delete;
    ~Configuration() { unsetenv("XDG_CONFIG_HOME"); }

    [[nodiscard]] fs::path file() const { return folder_ / "tzdraft" / "settings.json"; }

private:
    fs::path folder_ = scratch("configuration");
};

// How often a text occurs in another.
int countOf(std::string const& text, std::string const& all) {
    int count = 0;
    for (std::size_t at = 0; (at = all.find(text, at)) != std::string::npos; at += text.size())
        ++count;
    return count;
}

constexpr char kFolder[] = "";  // in the place of the file

struct SettingsRow {
    char const* name;
    char const* bytes;
    char const* problem;  // after the file's name
};
constexpr SettingsRow kSettings[] = {
    {"Folder", kFolder, ": Is a directory"},
    {"Malformed", "{\"variables\": {\"ATTIPE\": 1},\n", ":1: "},
    {"DrawingsVariable", "{\"variables\": {\"ATTIPE\": 1,\n\"LUNITS\": 1}}",
     ":2: variables.LUNITS: is not kept in the settings"},
    {"UnknownMember", "{\"variables\": {\"ATTIPE\": 1},\n\"colour\": \"x\"}",
     ":2: colour: there is no such setting"},
};
class UnusableSettings : public testing::TestWithParam<SettingsRow> {};

// A variable that is set meanwhile is not kept, since that would drop the rest of the file.
TEST_P(UnusableSettings, AreOneLineAndStayAsTheyAre) {
    Configuration const configuration;
    std::string const bytes = GetParam().bytes;
    if (bytes.empty()) {
        fs::create_directory(configuration.file());
    } else {
        scratch("configuration/tzdraft/settings.json", bytes);
    }
    auto const script = scratch("set.scr", "SETVAR\nATTIPE\n\nSETVAR\nCURSORTYPE\n1\nQUIT\n");
    auto const saved = scratch("plan.json");
    tztest::ProgramRun const run =
        tztest::runProgram({"--script", script.string(), "--save", saved.string()});
    EXPECT_EQ(run.status, 0);
    EXPECT_EQ(run.errors, "");
    EXPECT_EQ(countOf(configuration.file().string() + GetParam().problem, run.output), 1)
        << run.output;
    EXPECT_EQ(countOf(configuration.file().string(), run.output), 1) << run.output;
    EXPECT_EQ(countOf("<0>", run.output), 2) << run.output;  // both at their defaults
    EXPECT_EQ(tztest::bytesOf(configuration.file()), bytes);
    EXPECT_NE(tztest::bytesOf(saved), "");
}
INSTANTIATE_TEST_SUITE_P(Rows, UnusableSettings, testing::ValuesIn(kSettings), [](auto const& row) {
    return row.param.name;
});

// A foreign drawing never chooses which program runs.
TEST(ForeignDrawing, DecidesNoVariableOfTheUser) {
    Configuration const configuration;
    auto const drawing = scratch(
        "foreign.json", "{\"format\": \"tz-drawing\", \"version\": 1, \"variables\": {\n"
                        "\"MTEXTED\": \"/bin/false\",\n\"CMDACTIVE\": 5, \"TEXTSIZE\": 7}}");
    auto const script = scratch("show.scr", "SETVAR\nMTEXTED\n\nSETVAR\nTEXTSIZE\n\nQUIT\n");
    auto const saved = scratch("plan.json");
    tztest::ProgramRun const run = tztest::runProgram(
        {drawing.string(), "--script", script.string(), "--save", saved.string()});
    EXPECT_EQ(run.status, 0);
    EXPECT_EQ(countOf("foreign.json:2: member \"variables.MTEXTED\": a drawing does not decide it, "
                      "left out\n",
                      run.output),
              1)
        << run.output;
    EXPECT_EQ(countOf("a drawing does not decide it", run.output), 2) << run.output;
    EXPECT_EQ(countOf("<Internal>", run.output), 1) << run.output;
    EXPECT_EQ(countOf("<7>", run.output), 1) << run.output;
    EXPECT_EQ(tztest::bytesOf(saved).find("MTEXTED"), std::string::npos);
    EXPECT_FALSE(exists(configuration.file()));
}

// The program used to be kept in the settings, and ran in every later session.
TEST(ForeignScript, ChoosesTheEditorForItsRunAlone) {
    Configuration const configuration;
    auto const script =
        scratch("set.scr", "SETVAR\nmtexted\nevil\nSETVAR\nMTEXTED\n\nSETVAR\nATTIPE\n1\nQUIT\n");
    tztest::ProgramRun const run = tztest::runProgram({"--script", script.string()});
    EXPECT_EQ(run.status, 0) << run.errors;
    EXPECT_EQ(countOf("<evil>", run.output), 1) << run.output;
    std::string const kept = tztest::bytesOf(configuration.file());
    EXPECT_EQ(kept.find("MTEXTED"), std::string::npos) << kept;
    EXPECT_NE(kept.find("\"ATTIPE\": 1"), std::string::npos) << kept;
}

// A module in the working folder used to be loaded by its bare name. A name that is too long used
// to end the command.
TEST(ForeignModule, IsLoadedByAPathAlone) {
    fs::path const here = fs::current_path();
    fs::current_path(scratch(""));
    scratch("stray.tzx", "no module");
    auto const script = scratch("load.scr", "LOAD\nstray.tzx\nLOAD\n./stray.tzx\nLOAD\n" +
                                                std::string(300, 'n') + "\nQUIT\n");
    tztest::ProgramRun const run = tztest::runProgram({"--script", script.string()});
    fs::current_path(here);
    fs::path const beside = tztest::libraryFolder() / "stray.tzx";
    EXPECT_EQ(countOf("\n" + beside.string() + ": the module cannot be loaded", run.output), 1)
        << run.output;
    EXPECT_EQ(countOf("/./stray.tzx: the module cannot be loaded", run.output), 1) << run.output;
    EXPECT_EQ(countOf("n: the module cannot be loaded", run.output), 1) << run.output;
}

}  // namespace
