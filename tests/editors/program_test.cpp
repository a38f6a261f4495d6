// Programs that are run on a file.

#include <gtest/gtest.h>

#include <unistd.h>

#include <chrono>
#include <csignal>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <new>
#include <string>

#include "host/base/memory_faults.h"
#include "host/command_line/command_line.h"
#include "host/editors/editor_programs.h"
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

// A failure after the fork used to leave two hosts, each of which went on with the script.
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

int endSignals = 0;
void countSignal(int) {
    ++endSignals;
}

// The host used to die alone, and left the program and its file behind.
TEST(Programs, GetTheSignalThatEndsTheSession) {
    std::ofstream("ending.sh") << "kill -TERM $PPID; sleep 60\n";
    auto* const before = std::signal(SIGTERM, countSignal);
    auto const start = std::chrono::steady_clock::now();
    tzhost::ProgramResult const result = tzhost::runProgram("/bin/sh ending.sh", "note.txt");
    EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(30));
    EXPECT_EQ(result.problem, "was killed by signal 15");
    EXPECT_EQ(endSignals, 1);
    EXPECT_EQ(std::signal(SIGTERM, before), countSignal) << "taken back";
}

// A session at a terminal, which asks nothing here.
class Terminal : public tzhost::AnswerSource {
public:
    tzhost::Answer next(tzhost::AnswerRequest const&) override { return {}; }
    [[nodiscard]] bool isPerson() const override { return true; }
};

// There used to be no editor unless the user had named one.
TEST(Editors, AreLookedForAtATerminalAlone) {
    namespace fs = std::filesystem;
    std::string const before = std::getenv("PATH");
    fs::path const folder = fs::absolute("programs");
    fs::create_directories(folder);
    setenv("PATH", ("programs:" + folder.string()).c_str(), 1);
    EXPECT_EQ(tzhost::textEditorProgram(), "") << "a script";
    Terminal terminal;
    tzhost::commandLine().setSource(&terminal);
    EXPECT_EQ(tzhost::textEditorProgram(), "") << "nothing is there";
    for (char const* const name : {"vi", "editor"}) {
        std::ofstream(folder / name) << "#!/bin/sh\n";
        fs::permissions(folder / name, fs::perms::owner_all);
        EXPECT_EQ(tzhost::textEditorProgram(), (folder / name).string());
    }
    tzhost::editorConfiguration().textEditor = "nano";
    EXPECT_EQ(tzhost::textEditorProgram(), "nano");
    tzhost::editorConfiguration().textEditor.clear();
    tzhost::commandLine().reset();
    fs::remove_all(folder);
    setenv("PATH", before.c_str(), 1);
}

}  // namespace
