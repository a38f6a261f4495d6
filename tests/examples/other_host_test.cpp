// The program of examples/other_host, which lives with the module by a linker and a command stack
// of its own.

#include <gtest/gtest.h>

#include <cstdio>
#include <cstdlib>

#include "tests/support/program_run.h"

namespace {

// What the program prints, then its exit status.
std::string outputOf(std::string const& module) {
    std::string const program = (tztest::libraryFolder().parent_path() / "bin/other_host").string();
    std::string const file = tztest::scratch("other_host.txt").string();
    std::string const command = program + " " + module + " > " + file + " 2>&1";
    int const status = std::system(command.c_str());  // NOLINT(bugprone-command-processor): ours
    return tztest::bytesOf(file) + std::to_string(status >> 8);
}

TEST(OtherHost, LoadsTheModuleAndLetsItGo) {
    std::string const output = outputOf((tztest::libraryFolder() / "tzmted.tzx").string());
    EXPECT_EQ(output.find("+ MTEDIT (MTEDIT) of TZCORE_MTEXT, flags 0x2\n"), 0U) << output;
    EXPECT_NE(output.find("+ -MTEXT (-MTEXT) of TZCORE_MTEXT, flags 0x2\n"), std::string::npos)
        << output;
    EXPECT_TRUE(output.ends_with("started with 0\n"
                                 "- TZCORE_MTEXT\n"
                                 "the file is gone from the process\n0"))
        << output;
}

TEST(OtherHost, RefusesWhatIsNoModule) {
    EXPECT_EQ(outputOf("missing.tzx"), "missing.tzx: no module\n2");
}

}  // namespace
