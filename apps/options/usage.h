#pragma once

#include <CLI/CLI.hpp>
#include <string>

namespace tzapps {

// What is wrong with the arguments, in the language of the user: the option parser speaks English.
[[nodiscard]] std::string problemWith(CLI::ParseError const& wrong);

}  // namespace tzapps
