#pragma once

#include <CLI/CLI.hpp>
#include <string>
#include <vector>

namespace tzapps {

// What is wrong with the arguments of a command, in the language of the user: the option parser
// speaks English. An option that is none names the one that it is near to.
[[nodiscard]] std::string problemWith(CLI::App const& command, CLI::ParseError const& wrong);

// "; did you mean ...?", or nothing when no word is near.
[[nodiscard]] std::string nearMiss(std::string const& typed,
                                   std::vector<std::wstring> const& words);

}  // namespace tzapps
