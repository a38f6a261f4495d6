#pragma once

#include "apps/tzdraft/draft_options.h"

namespace tzdraft {

// What no option is wrong about alone: a result over another one, or over a file that the run
// reads, however it is named; and a result that would get the name "-", which stands for standard
// output elsewhere. The drawing that is opened may be saved over. Throws CLI::ValidationError.
void checkFiles(Options const& options);

}  // namespace tzdraft
