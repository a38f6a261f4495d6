// A whole session in German: the same drawing as in English, and nothing on the screen that is
// English. german.scr answers with German words, global.scr with those of every language.

#include <gtest/gtest.h>

#include <cstdlib>
#include <fstream>
#include <set>
#include <sstream>
#include <vector>

#include "tests/support/program_run.h"

namespace {

namespace fs = std::filesystem;
using tztest::scratch;

struct LanguageSession {
    std::string screen;
    std::string drawing;
};

// Runs a script, on the drawing of its name if there is one.
LanguageSession playFile(fs::path const& file, char const* language) {
    fs::path const saved = scratch("session.json");
    fs::path const settings = scratch("settings.json", "{}");
    std::vector<std::string> arguments{"--locale", language,      "--settings", settings.string(),
                                       "--script", file.string(), "--save",     saved.string()};
    fs::path drawing = file;
    if (fs::exists(drawing.replace_extension(".json"))) arguments.push_back(drawing.string());
    tztest::ProgramRun const run = tztest::runProgram(arguments);
    EXPECT_EQ(run.status, 0);
    EXPECT_EQ(run.errors, "");
    return {run.output, tztest::bytesOf(saved)};
}

LanguageSession play(char const* script, char const* language) {
    return playFile(tztest::sourceFolder() / "tests/languages" / script, language);
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
        // The question of an attribute is the drafter's own text, and so is its name.
        bool const isDrafters = line.find("RAUM ") <= 2;  // LISTE indents it
        EXPECT_TRUE(isDrafters || english.count(line) == 0) << line;
    }
}

// What the loader and the parser of files say in English whatever the language.
TEST(GermanSession, HasNoEnglishOfLibraries) {
    fs::path const file = scratch("broken.json", "{\"a\": -}");
    fs::path const script =
        scratch("broken.scr", "LADEN\n/nein.tzx\nÖFFNEN\n" + file.string() + "\n");
    std::string const seen = tztest::runProgram({"--locale", "de", "--script", script}).output;
    for (char const* const text :
         {": die Datei lässt sich nicht öffnen: Datei oder Ordner nicht gefunden\n",
          ": ist hier kein JSON: ungültige Zahl; erwartet wird eine Ziffer nach '-'\n"})
        EXPECT_NE(seen.find(text), seen.npos) << seen;
    std::string const help = tztest::startProgram("--locale de --help").output;
    EXPECT_NE(help.find("\n  ZEICHNUNG  "), help.npos) << help;
}

// Each script of examples/ runs in every language: no local word takes the place of a word in it.
TEST(Examples, DrawTheSameInEachLanguage) {
    int count = 0;
    for (auto const& entry : fs::directory_iterator(tztest::sourceFolder() / "examples")) {
        if (entry.path().extension() != ".scr") continue;
        ++count;
        EXPECT_EQ(playFile(entry.path(), "de").drawing, playFile(entry.path(), "en").drawing)
            << entry.path();
    }
    EXPECT_GT(count, 1);
}

}  // namespace
