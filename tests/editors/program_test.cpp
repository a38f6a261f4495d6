// Programs that are run on a file.

#include <gtest/gtest.h>

#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <new>
#include <string>

#include "host/base/memory_faults.h"
#include "host/editors/program.h"
#include "host/faults/fault_plan.h"

namespace {

constexpr char kSecond[] = "second-host";

void runWithFault(tzhost::FaultPlan& plan) {
    plan.install();
    try {
        tzhost::MemoryFaultScope const command;
        (void)tzhost::runProgram("true", "note.txt");
    } catch (std::bad_alloc const&) {
        EXPECT_TRUE(plan.hasStruck());
    }
    plan.remove();
}

// A failure behind the fork used to leave two hosts, each of which went on with the script.
TEST(Programs, LeaveOneHostWhicheverAllocationFails) {
    std::filesystem::remove(kSecond);
    pid_t const host = getpid();
    bool struck = true;
    int call = 0;
    while (struck && ++call < 200) {
        tzhost::FaultPlan plan;
        ASSERT_FALSE(plan.add("operator new:" + std::to_string(call)));
        runWithFault(plan);
        if (getpid() != host) {
            std::ofstream(kSecond) << call;
            _exit(1);
        }
        struck = plan.hasStruck();
    }
    EXPECT_FALSE(struck) << "the sweep came to its end";
    EXPECT_FALSE(std::filesystem::exists(kSecond)) << "at allocation " << call;
}

}  // namespace
