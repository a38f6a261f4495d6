#pragma once

#include "apps/tzconvert/options.h"

namespace tzconvert {

// Converts what the options name, one after the other; returns the exit status. A file that fails
// is named on standard error and the others are converted.
[[nodiscard]] int run(Options const& options);

}  // namespace tzconvert
