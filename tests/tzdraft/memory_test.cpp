// Runs that want events while memory fails: the events are told whole, and the program goes on.

#include <gtest/gtest.h>

#include "tests/support/program_run.h"

namespace {

using tztest::scratch;

// What was built for the events used to end the program when memory failed, and NEW used to leave
// the session without a document.
TEST(MemoryFaults, LeaveEventsWhole) {
    constexpr int kCalls = 800;
    constexpr int kStep = 7;
    auto const script = scratch(
        "two.scr", "NEW\n-MTEXT\n0,0\n@5,2\nNote\n\nMTEXT\n0,0\n~3,3\n5,5\n<<<\nabc\n>>>\nQUIT\n");
    auto const file = scratch("two.jsonl");
    for (int call = 1; call <= kCalls; call += kStep) {
        tztest::ProgramRun const run =
            tztest::runProgram({"--script", script.string(), "--events", file.string(), "--fail",
                                "operator new:" + std::to_string(call)});
        EXPECT_LE(run.status, 1) << call << ": " << run.errors;
        int audits = 0;
        for (auto const& event : tztest::eventsOf(file)) {
            if (event["event"] != "audit") continue;
            ++audits;
            EXPECT_TRUE(tztest::isClean(event)) << call << ": " << event;
        }
        EXPECT_EQ(audits, 4) << call << ": " << run.output;
    }
}

}  // namespace
