// A whole session in German: the same drawing as in English, and nothing on the screen that is
// English. german.scr answers with German words, global.scr with those of every language.

#include <gtest/gtest.h>

#include <cstdlib>
#include <fstream>
#include <set>
#include <sstream>

#include "tests/support/program_run.h"

namespace {

namespace fs = std::filesystem;
using tztest::scratch;

struct Session {
    std::string screen;
    std::string drawing;
};

Session play(char const* script, char const* language) {
    fs::path const saved = scratch("session.json");
    fs::path const settings = scratch("settings.json", "{}");
    fs::path const file = tztest::sourceFolder() / "tests/languages" / script;
    tztest::ProgramRun const run =
        tztest::runProgram({"--locale", language, "--settings", settings.string(), "--script",
                            file.string(), "--save", saved.string()});
    EXPECT_EQ(run.status, 0);
    EXPECT_EQ(run.errors, "");
    return {run.output, tztest::bytesOf(saved)};
}

std::set<std::string> linesOf(std::string const& text) {
    std::set<std::string> lines;
    std::istringstream input(text);
    for (std::string line; std::getline(input, line);)
        lines.insert(line);
    return lines;
}

TEST(GermanSession, LooksAsExpected) {
    std::string const seen = play("german.scr", "de").screen;
    fs::path const expectation = tztest::sourceFolder() / "tests/languages/german.txt";
    if (std::getenv("TZ_TEST_ACCEPT")) {
        std::ofstream(expectation, std::ios::binary) << seen;
    } else {
        EXPECT_EQ(tztest::bytesOf(expectation), seen);
    }
}

TEST(GermanSession, DrawsWhatTheEnglishOneDraws) {
    std::string const english = play("global.scr", "en").drawing;
    EXPECT_EQ(play("german.scr", "de").drawing, english);
    EXPECT_EQ(play("global.scr", "de").drawing, english) << "global words under German";
    EXPECT_NE(english.find("Im Editor\\\\Pgeschrieben"), english.npos);
}

TEST(GermanSession, HasNoLineOfTheEnglishOne) {
    std::set<std::string> const english = linesOf(play("global.scr", "en").screen);
    for (std::string const& line : linesOf(play("german.scr", "de").screen)) {
        // The question of an attribute is the drafter's own text.
        bool const isDrafters = line.starts_with("RAUM ");
        EXPECT_TRUE(isDrafters || english.count(line) == 0) << line;
    }
}

}  // namespace
