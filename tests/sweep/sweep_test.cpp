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

std::vector<std::string> examples() {
    std::vector<std::string> names;
    std::filesystem::path const folder =
        std::filesystem::path(std::getenv("TZ_TEST_SOURCE")) / "examples";
    for (auto const& entry : std::filesystem::directory_iterator(folder)) {
        if (entry.path().extension() == ".scr") names.push_back(entry.path().string());
    }
    std::sort(names.begin(), names.end());
    return names;
}

std::string contentsOf(std::string const& file) {
    std::ifstream in(file, std::ios::binary);
    return {std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>()};
}

SweepDepth depth() {
    char const* const all = std::getenv("TZ_TEST_SWEEP");
    if (all && std::string(all) == "all") return {std::numeric_limits<long>::max(), 0};
    return {50, 10};
}

void show(SweepCounts const& counts) {
    std::printf("%ld commands, %ld questions, %ld host calls, %ld tries\n", counts.commands,
                counts.questions, counts.calls, counts.tries);
}

TEST(CancelSweep, LeavesTheDrawingAsItWas) {
    for (std::string const& file : examples()) {
        SCOPED_TRACE(file);
        show(sweepScript(contentsOf(file), Sweep::cancels, depth(), [](SweepTry const& done) {
            EXPECT_TRUE(done.auditIsClean) << done.command << ", " << done.what;
            EXPECT_TRUE(done.drawingIsUntouched) << done.command << ", " << done.what;
        }));
    }
}

TEST(FaultSweep, LeavesAValidDrawingAndNothingOpen) {
    for (std::string const& file : examples()) {
        SCOPED_TRACE(file);
        show(sweepScript(contentsOf(file), Sweep::faults, depth(), [](SweepTry const& done) {
            EXPECT_TRUE(done.auditIsClean) << done.command << ", " << done.what;
            EXPECT_TRUE(done.drawingIsValid) << done.command << ", " << done.what;
        }));
    }
}

}  // namespace
