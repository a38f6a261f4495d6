#pragma once

#include "apps/tzconvert/options.h"
#include "apps/tzconvert/streams.h"

namespace tzconvert {

// Puts the settings of the machine in place that the options name: its code page and its font map.
// A setting that cannot be used is a failure.
[[nodiscard]] Failure prepareMachine(Options const& options);

}  // namespace tzconvert
