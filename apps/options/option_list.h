#pragma once

#include <CLI/CLI.hpp>
#include <map>
#include <optional>
#include <string>
#include <vector>

// The options of a program as data, from the same declarations that --help prints. The build makes
// manual pages and the completions of shells from them (scripts/option_pages.py).
namespace tzapps {

// Given alone, --option-list asks for a JSON object; help does not show it:
//
//   {"program": "tzdraft", "options": [OPTION...], "commands": [{"name", "help", "options"}...]}
//
// with an OPTION for each option and each argument without one, in the order of --help:
//
//   {"names": ["-h", "--help"], "value": "FILE", "help": "write there"}
//
// "words" are those that a value is often taken from, as a shell may offer them.
// An argument has "argument": its name in place of "names"; an option without a value no "value".
// Where the value has another name in the user's language, "shown" is that.
// Nothing when the arguments ask for something else.
using ValueWords = std::map<std::string, std::vector<std::string>>;  // by the option's long name
[[nodiscard]] std::optional<std::string>
optionList(CLI::App const& app, ValueWords const& words, int count, char const* const* arguments);

}  // namespace tzapps
