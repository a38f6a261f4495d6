#include "tests/support/program_run.h"

#include <sys/wait.h>

#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <sstream>

#include "apps/tzdraft/draft_program.h"

namespace tztest {
namespace {

namespace fs = std::filesystem;

fs::path folder(char const* variable) {
    char const* const value = std::getenv(variable);
    return value ? value : ".";
}

}  // namespace

fs::path libraryFolder() {
    return folder("TZ_TEST_LIB");
}

fs::path sourceFolder() {
    return folder("TZ_TEST_SOURCE");
}

fs::path scratch(std::string const& name) {
    return folder("TZ_TEST_SCRATCH") / name;
}

fs::path scratch(std::string const& name, std::string const& bytes) {
    fs::path file = scratch(name);
    std::ofstream(file, std::ios::binary) << bytes;
    return file;
}

std::string bytesOf(fs::path const& file) {
    std::ifstream input(file, std::ios::binary);
    std::ostringstream bytes;
    bytes << input.rdbuf();
    return bytes.str();
}

ProgramRun runProgram(std::vector<std::string> const& arguments) {
    std::vector<char const*> words{"tzdraft"};
    for (std::string const& each : arguments)
        words.push_back(each.c_str());
    tzdraft::ParsedOptions parsed =
        tzdraft::parseOptions(static_cast<int>(words.size()), words.data());
    if (parsed.exit) return {*parsed.exit, {}, "wrong arguments"};
    if (parsed.options.module.empty()) parsed.options.module = libraryFolder() / "tzmted.tzx";
    ProgramRun run;
    run.status = tzdraft::runProgram(parsed.options,
                                     {[&](std::string_view text) { run.output += text; },
                                      [&](std::string_view text) { run.errors += text; }, nullptr});
    return run;
}

ProgramRun startProgram(std::string const& arguments, std::string const& before) {
    fs::path const output = scratch("program.out");
    fs::path const errors = scratch("program.err");
    std::string const command = before + (folder("TZ_TEST_BIN") / "tzdraft").string() + " " +
                                arguments + " </dev/null >" + output.string() + " 2>" +
                                errors.string();
    int const status = std::system(command.c_str());
    return {WIFEXITED(status) ? WEXITSTATUS(status) : -1, bytesOf(output), bytesOf(errors)};
}

std::vector<nlohmann::ordered_json> eventsOf(fs::path const& file) {
    std::vector<nlohmann::ordered_json> events;
    std::ifstream input(file);
    for (std::string line; std::getline(input, line);)
        events.push_back(nlohmann::ordered_json::parse(line));
    return events;
}

bool isClean(nlohmann::ordered_json const& audit) {
    for (auto const& [name, value] : audit.items()) {
        if (name != "event" && value != 0 && value != false) return false;
    }
    return true;
}

}  // namespace tztest
