#pragma once

#include <CLI/CLI.hpp>

#include "apps/tzdraft/draft_options.h"

// The options that say what plots are put on.
namespace tzdraft {

void declarePage(CLI::App& app, Options& options);

// What no option is wrong about alone: a page without room, a picture with several pages, standard
// output for two plots. Throws CLI::ValidationError.
void checkPage(Options const& options);

}  // namespace tzdraft
