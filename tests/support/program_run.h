#pragma once

#include <filesystem>
#include <nlohmann/json.hpp>
#include <string>
#include <vector>

#include "apps/tzdraft/draft_options.h"

// The program in the test's own process, with the real module and the resources of this build.
//
//   fs::path const script = tztest::scratch("a.scr", "-MTEXT\n...");
//   tztest::ProgramRun const run = tztest::runProgram({"--script", script});
//   EXPECT_EQ(run.status, tzdraft::kDone) << run.errors;
//
// Files lie in the suite's own scratch folder.
namespace tztest {

struct ProgramRun {
    int status = 0;
    std::string output;  // the transcript
    std::string errors;
};

// Arguments as on a command line, without the program's name; they must be right.
[[nodiscard]] ProgramRun runProgram(std::vector<std::string> const& arguments);
// The same in a process of its own, for arguments that may be wrong. `before` stands before the
// program for the shell, such as "ulimit -f 8; ".
[[nodiscard]] ProgramRun startProgram(std::string const& arguments, std::string const& before = "");

// Folders of this build and of the source tree.
[[nodiscard]] std::filesystem::path libraryFolder();
[[nodiscard]] std::filesystem::path sourceFolder();
// The path of a scratch file; the second form writes it.
[[nodiscard]] std::filesystem::path scratch(std::string const& name);
std::filesystem::path scratch(std::string const& name, std::string const& bytes);

// The bytes of a file; empty when it cannot be read.
[[nodiscard]] std::string bytesOf(std::filesystem::path const& file);
// The events of a run, in order.
[[nodiscard]] std::vector<nlohmann::ordered_json> eventsOf(std::filesystem::path const& file);
// Whether all counters of an audit event stand at zero.
[[nodiscard]] bool isClean(nlohmann::ordered_json const& audit);

}  // namespace tztest
