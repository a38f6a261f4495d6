// Nothing that fails or is cancelled leaves a trace: every question of every command of the
// examples is cancelled, and every host call of it fails once.

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <limits>
#include <sstream>

#include "tests/sweep/command_sweep.h"

namespace {

using namespace tztest;

std::vector<std::filesystem::path> examples() {
    std::vector<std::filesystem::path> names;
    std::filesystem::path const folder =
        std::filesystem::path(std::getenv("TZ_TEST_SOURCE")) / "examples";
    for (auto const& entry : std::filesystem::directory_iterator(folder)) {
        if (entry.path().extension() == ".scr") names.push_back(entry.path());
    }
    std::sort(names.begin(), names.end());
    return names;
}

// A script with the drawing beside it.
SweepInput inputOf(std::filesystem::path const& file) {
    std::ifstream in(file, std::ios::binary);
    SweepInput input{{std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>()}, {}};
    std::filesystem::path const start = std::filesystem::path(file).replace_extension(".json");
    if (std::filesystem::exists(start)) input.drawing = start;
    return input;
}

SweepDepth depth() {
    char const* const all = std::getenv("TZ_TEST_SWEEP");
    if (all && std::string(all) == "all") return {std::numeric_limits<long>::max(), 0};
    return {50, 10};
}

void show(std::string const& name, SweepCounts const& counts) {
    std::printf("%-16s %4ld commands, %5ld questions, %8ld host calls, %7ld tries\n", name.c_str(),
                counts.commands, counts.questions, counts.calls, counts.tries);
}

// Plays every example and prints its counts and their sums.
void sweepExamples(Sweep kind, std::function<void(SweepTry const&)> const& judge) {
    SweepCounts sum;
    for (std::filesystem::path const& file : examples()) {
        SCOPED_TRACE(file.string());
        SweepCounts const counts = sweepScript(inputOf(file), kind, depth(), judge);
        show(file.stem().string(), counts);
        sum.commands += counts.commands;
        sum.questions += counts.questions;
        sum.calls += counts.calls;
        sum.tries += counts.tries;
    }
    show("all", sum);
}

// What a command is known to leave: MTEDIT keeps its set when it cannot learn how long it is, and a
// text of TEXTALIGN stays highlighted when it cannot be opened at the moment that would end that.
bool isKnown(SweepTry const& done) {
    if (done.command == "MTEDIT") return done.what == "tzedSSLength:1";
    return done.command == "TEXTALIGN" && done.onlyHighlightingIsLeft &&
           done.what.starts_with("tzdbOpenObject:");
}

TEST(CancelSweep, LeavesTheDrawingAsItWas) {
    sweepExamples(Sweep::cancels, [](SweepTry const& done) {
        EXPECT_TRUE(done.auditIsClean) << done.command << ", " << done.what;
        EXPECT_TRUE(done.drawingIsUntouched) << done.command << ", " << done.what;
    });
}

TEST(FaultSweep, LeavesAValidDrawingAndNothingOpen) {
    sweepExamples(Sweep::faults, [](SweepTry const& done) {
        EXPECT_TRUE(done.auditIsClean || isKnown(done)) << done.command << ", " << done.what;
        EXPECT_TRUE(done.drawingIsValid) << done.command << ", " << done.what;
    });
}

}  // namespace
