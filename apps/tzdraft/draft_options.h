#pragma once

#include <filesystem>
#include <optional>
#include <string>
#include <vector>

#include "host/display/plot.h"
#include "host/page/page.h"

// What the program was told on its command line.
namespace tzdraft {

// Exit statuses.
inline constexpr int kDone = 0;
inline constexpr int kFailed = 1;    // the session ended early, or a script asked for what failed
inline constexpr int kUnusable = 2;  // wrong usage, an unusable file, or no module
inline constexpr int kLeftOver = 3;  // a command left something open

struct Options {
    std::filesystem::path drawing;  // empty: a new one
    std::string script;             // "-" is standard input, empty an interactive session
    std::filesystem::path save;
    std::filesystem::path svg;
    std::filesystem::path png;
    std::filesystem::path pdf;
    tzhost::PageChoice page;  // of the plots
    tzhost::PlotSpace space = tzhost::PlotSpace::active;
    std::vector<std::string> variables;  // NAME=VALUE
    std::filesystem::path fontMap;
    std::string locale;
    std::filesystem::path settings;
    std::filesystem::path module;
    std::filesystem::path resources;
    std::string richTextEditor;
    std::string textEditor;
    std::filesystem::path events;
    bool isStrict = false;            // a script ends at the first thing that goes wrong
    bool isQuiet = false;             // a script's transcript is kept to errors
    std::vector<std::string> faults;  // NAME[:K][=STATUS]
};

// Whether a plot goes to standard output, so that the transcript goes to standard error.
[[nodiscard]] bool plotsToOutput(Options const& options);

struct ParsedOptions {
    Options options;
    std::optional<int> exit;  // the program ends at once with this status
};

// Reads the arguments. --help and --version print to standard output and end with 0; a wrong
// argument is one line on standard error and ends with 2.
[[nodiscard]] ParsedOptions parseOptions(int count, char const* const* arguments);

}  // namespace tzdraft
