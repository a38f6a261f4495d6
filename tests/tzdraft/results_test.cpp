// Results that cannot be written: one line that says so, and the files that were there before.

#include <gtest/gtest.h>

#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>

#include "tests/support/program_run.h"

namespace {

namespace fs = std::filesystem;
using tztest::scratch;

constexpr char kOld[] = "as it was";

struct ResultRow {
    char const* name;
    char const* option;
    char const* problem;
};
constexpr ResultRow kRows[] = {
    {"Drawing", "--save", ": cannot be written: "},
    {"Svg", "--svg", ": cannot be written: "},
    {"Png", "--png", ": cannot be written: "},
    {"Pdf", "--pdf", ": cannot be written: "},
    {"Events", "--events", ": the events cannot be written"},
};

class Result : public testing::TestWithParam<ResultRow> {
protected:
    Result() {
        fs::remove_all(folder_);
        fs::create_directories(folder_);
        script_ = scratch("note.scr", "-MTEXT\n0,0\n40,-20\n{\\fDejaVu Sans;A note}\n\nQUIT\n");
    }

    [[nodiscard]] fs::path file() const { return folder_ / "result"; }
    [[nodiscard]] std::string words(fs::path const& file) const {
        return "--script " + script_.string() + " " + GetParam().option + " " + file.string();
    }
    static void expectRefused(tztest::ProgramRun const& run, fs::path const& file) {
        EXPECT_EQ(run.status, 2) << run.errors;
        EXPECT_TRUE(run.errors.starts_with("tzdraft: " + file.string() + GetParam().problem))
            << run.errors;
        EXPECT_EQ(std::count(run.errors.begin(), run.errors.end(), '\n'), 1) << run.errors;
    }
    void expectOnlyTheOldFile() const {
        EXPECT_EQ(tztest::bytesOf(file()), kOld);
        EXPECT_EQ(std::distance(fs::directory_iterator(folder_), {}), 1);
    }

    fs::path const folder_ = scratch("results");
    fs::path script_;
};

TEST_P(Result, IntoNoFolderIsSaid) {
    fs::path const nowhere = folder_ / "nosuch" / "result";
    expectRefused(tztest::startProgram(words(nowhere)), nowhere);
}

// Plots and events used to end the program by a signal.
TEST_P(Result, BeyondTheSizeLimitLeavesTheOldFile) {
    scratch("results/result", kOld);
    expectRefused(tztest::startProgram(words(file()), "ulimit -f 1; "), file());
    expectOnlyTheOldFile();
}

// Nobody is asked where options or a script name the file.
TEST_P(Result, OntoAReadOnlyFileLeavesIt) {
    ASSERT_EQ(chmod(scratch("results/result", kOld).c_str(), 0444), 0);
    tztest::ProgramRun const run = tztest::startProgram(words(file()));
    expectRefused(run, file());
    EXPECT_NE(run.errors.find("it is read-only\n"), std::string::npos) << run.errors;
    expectOnlyTheOldFile();
}

// The root user may write anywhere, so that another one runs the program then.
TEST_P(Result, IntoALockedFolderLeavesTheOldFile) {
    scratch("results/result", kOld);
    ASSERT_EQ(chmod(folder_.c_str(), 0555), 0);
    std::string before;
    if (geteuid() == 0) {
        before = "setpriv --reuid=65534 --regid=65534 --clear-groups ";
        if (tztest::startProgram("--version", before).status != 0) {
            GTEST_SKIP() << "no other user can run the program here";
        }
    }
    expectRefused(tztest::startProgram(words(file()), before), file());
    ASSERT_EQ(chmod(folder_.c_str(), 0755), 0);
    expectOnlyTheOldFile();
}

INSTANTIATE_TEST_SUITE_P(Rows, Result, testing::ValuesIn(kRows), [](auto const& row) {
    return row.param.name;
});

// Unfinished events used to be written to a file of this name, over whatever it held.
TEST(Results, OfEventsLeaveOtherFilesAlone) {
    auto const script = scratch("quit.scr", "QUIT\n");
    auto const other = scratch("quit.jsonl.part", kOld);
    auto const events = scratch("quit.jsonl");
    tztest::ProgramRun const run =
        tztest::runProgram({"--script", script.string(), "--events", events.string()});
    EXPECT_EQ(run.status, 0) << run.errors;
    EXPECT_EQ(tztest::bytesOf(other), kOld);
    EXPECT_FALSE(tztest::eventsOf(events).empty());
}

// The program used to go on, or to end by a signal, with nothing saved.
TEST(Results, AreWrittenWhenTheTranscriptCannotBe) {
    auto const script = scratch("cut.scr", "CIRCLE\n1,2\n3\nCIRCLE\n");
    auto const saved = scratch("cut.json");
    std::string const words = "--script " + script.string() + " --save " + saved.string();
    std::string const errors = scratch("cut.err").string();
    for (char const* const output : {">/dev/full", "| true"}) {
        fs::remove(saved);
        (void)tztest::startProgram(words + " 2>" + errors + " " + output + " #");
        EXPECT_TRUE(
            tztest::bytesOf(errors).starts_with("tzdraft: the transcript cannot be written: "))
            << output << tztest::bytesOf(errors);
        EXPECT_NE(tztest::bytesOf(saved).find("\"tz-drawing\""), std::string::npos) << output;
    }
    EXPECT_EQ(tztest::startProgram(words + " >/dev/full 2>&1 #").status, 1);
}

// The transcript used to go into the file that took the number of standard output, and a plot for
// standard output nowhere. A device is no file that two results share.
TEST(Results, StayApartFromStreamsThatAreClosed) {
    std::string const words = "--script " + scratch("quit.scr", "QUIT\n").string();
    auto const events = scratch("closed.jsonl");
    tztest::ProgramRun const run =
        tztest::startProgram(words + " --save /dev/null --png /dev/null --events " +
                             events.string() + " <&- >&- 2>&- #");
    EXPECT_EQ(run.status, 0);
    EXPECT_FALSE(tztest::eventsOf(events).empty());
    EXPECT_EQ(tztest::startProgram(words + " --svg - >&- 2>&1 #").status, 2);
}

TEST(Results, ThatCanBeWrittenAreAndTheLineNamesThem) {
    auto const script = scratch("quit.scr", "QUIT\n");
    std::string const saved = scratch("saved.json").string();
    std::string const plotted = scratch("plotted.svg").string();
    std::string const nowhere = scratch("nosuch/result").string();
    tztest::ProgramRun const run = tztest::runProgram(
        {"--script", script.string(), "--save", saved, "--png", nowhere, "--svg", plotted});
    EXPECT_EQ(run.status, 2);
    EXPECT_EQ(run.errors, "tzdraft: " + nowhere +
                              ": cannot be written: No such file or directory; written: " + saved +
                              ", " + plotted + "\n");
    EXPECT_NE(tztest::bytesOf(saved).find("\"tz-drawing\""), std::string::npos);
    EXPECT_NE(tztest::bytesOf(plotted).find("</svg>"), std::string::npos);
}

}  // namespace
