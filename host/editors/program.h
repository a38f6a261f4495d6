#pragma once

#include <filesystem>
#include <string>
#include <string_view>
#include <vector>

// Runs an editor as a program of its own on one file. No shell reads the command or the file's
// name.
namespace tzhost {

// The words of a command: blanks part them, and quotes, single or double, keep blanks
// together.
[[nodiscard]] std::vector<std::string> splitCommand(std::string_view command);

struct ProgramResult {
    bool accepted = false;  // it ended with exit status 0
    std::string problem;    // why not: one clause, such as "ended with exit status 1"
};

// Runs the command with the file as its last argument and waits for its end. A program on the
// terminal has it meanwhile; afterwards the terminal is as it was, also when the program was
// killed. A signal that asks this process to end goes to the program too, so that the wait ends.
[[nodiscard]] ProgramResult runProgram(std::string_view command, std::filesystem::path const& file);

}  // namespace tzhost
