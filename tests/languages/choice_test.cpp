// Which language a session speaks.

#include <gtest/gtest.h>

#include <cstdlib>
#include <optional>

#include "apps/tzdraft/draft_options.h"
#include "tests/support/program_run.h"

namespace {

namespace fs = std::filesystem;
using tztest::scratch;

// Sets variables of the environment for the life of the object; a null value takes one away.
class Environment {
public:
    struct Setting {
        char const* name;
        char const* value;
    };
    explicit Environment(std::initializer_list<Setting> settings) {
        for (Setting const& each : settings) {
            char const* const before = std::getenv(each.name);
            before_.push_back(
                {each.name, before ? std::optional<std::string>(before) : std::nullopt});
            put(each.name, each.value);
        }
    }
    Environment(Environment const&) = delete;
    Environment& operator=(Environment const&) = delete;
    ~Environment() {
        for (auto const& [name, value] : before_)
            put(name, value ? value->c_str() : nullptr);
    }

private:
    static void put(char const* name, char const* value) {
        if (value) {
            setenv(name, value, 1);
        } else {
            unsetenv(name);
        }
    }
    std::vector<std::pair<char const*, std::optional<std::string>>> before_;
};

// The host's idle prompt and a text of the module, or what was complained about.
std::string spoken(std::vector<std::string> arguments) {
    fs::path const script = scratch("choice.scr", "_MTEXT\n^C\n");
    arguments.insert(arguments.end(), {"--script", script.string(), "--settings",
                                       scratch("choice.json", "{}").string()});
    tztest::ProgramRun const run = tztest::runProgram(arguments);
    EXPECT_EQ(run.status, run.errors.empty() ? tzdraft::kDone : tzdraft::kUnusable);
    if (!run.errors.empty()) return run.errors;
    std::string const firstWord = run.output.substr(0, run.output.find(':'));
    bool const isGerman = run.output.find("Erste Ecke angeben: ") != run.output.npos;
    return firstWord + (isGerman ? ", Erste Ecke" : ", first corner");
}

constexpr char kGerman[] = "Befehl, Erste Ecke";
constexpr char kEnglish[] = "Command, first corner";

struct EnvironmentRow {
    char const* name;
    char const* all;
    char const* messages;
    char const* lang;
    char const* expected;
};
constexpr EnvironmentRow kEnvironments[] = {
    {"AllFirst", "de_DE.UTF-8", "en_US.UTF-8", "en_US.UTF-8", kGerman},
    {"MessagesNext", nullptr, "de", "en_US.UTF-8", kGerman},
    {"LangLast", nullptr, nullptr, "de_CH.UTF-8", kGerman},
    {"EmptyIsNone", "", "", "de_DE@euro", kGerman},
    {"CIsEnglish", "C.UTF-8", "de_DE.UTF-8", "de_DE.UTF-8", kEnglish},
    {"PosixIsEnglish", nullptr, "POSIX", "de_DE.UTF-8", kEnglish},
    {"UnknownIsEnglish", nullptr, nullptr, "tlh_XX.UTF-8", kEnglish},
    {"NoPath", nullptr, nullptr, "../lib/de", kEnglish},
    {"NothingIsEnglish", nullptr, nullptr, nullptr, kEnglish},
};

class LanguageOfEnvironment : public testing::TestWithParam<EnvironmentRow> {};

TEST_P(LanguageOfEnvironment, IsSpoken) {
    EnvironmentRow const& row = GetParam();
    Environment const set{{"LC_ALL", row.all}, {"LC_MESSAGES", row.messages}, {"LANG", row.lang}};
    EXPECT_EQ(spoken({}), row.expected);
}

INSTANTIATE_TEST_SUITE_P(Variables,
                         LanguageOfEnvironment,
                         testing::ValuesIn(kEnvironments),
                         [](auto const& row) { return row.param.name; });

TEST(Locale, GoesAheadOfTheEnvironment) {
    Environment const set{{"LC_ALL", "de_DE.UTF-8"}};
    EXPECT_EQ(spoken({"--locale", "en"}), kEnglish);
    EXPECT_EQ(spoken({"--locale", "C"}), kEnglish);
    Environment const other{{"LC_ALL", "C"}};
    EXPECT_EQ(spoken({"--locale", "de_AT"}), kGerman);
}

TEST(Locale, IsRefusedWithoutTexts) {
    for (std::string const locale : {"tlh", "../lib/de", "de_/../de"}) {
        std::string const said = spoken({"--locale", locale});
        EXPECT_TRUE(said.starts_with("tzdraft: --locale " + locale +
                                     ": no texts of this language; there are en, de"))
            << said;
    }
}

// A library that is named speaks for the module, the locale for the host.
TEST(Locale, StandsBesideANamedLibrary) {
    std::string const german = (tztest::libraryFolder() / "de/TzmtedRes.dll").string();
    EXPECT_EQ(spoken({"--resources", german}), "Command, Erste Ecke");
    EXPECT_EQ(spoken({"--resources", german, "--locale", "tlh"}), "Command, Erste Ecke");
}

TEST(Locale, ReachesTheFirstComplaints) {
    tztest::ProgramRun const run = tztest::runProgram(
        {"--locale", "de", "--script", scratch("missing.scr").string() + ".none"});
    EXPECT_EQ(run.status, tzdraft::kUnusable);
    EXPECT_NE(run.errors.find(": das Skript ist nicht lesbar: Datei"), run.errors.npos)
        << run.errors;
}

TEST(Locale, LeavesNumbersAsTheyAre) {
    fs::path const script = scratch("numbers.scr", "KREIS\n0,0\n1.5\nLISTE\nl\n\n");
    tztest::ProgramRun const run =
        tztest::runProgram({"--locale", "de", "--script", script.string(), "--settings",
                            scratch("numbers.json", "{}").string()});
    EXPECT_NE(run.output.find("Halbmesser       1.5000\n"), run.output.npos) << run.output;
}

}  // namespace
