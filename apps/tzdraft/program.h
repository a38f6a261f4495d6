#pragma once

#include <functional>
#include <string_view>

#include "apps/tzdraft/options.h"

// The program from its options to its exit status, also for tests, which run it in their own
// process: each run begins with everything at its start and leaves nothing behind.
namespace tzdraft {

struct Screens {
    std::function<void(std::string_view)> output;  // the transcript, UTF-8
    std::function<void(std::string_view)> errors;  // lines about what could not be done
};

[[nodiscard]] int runProgram(Options const& options, Screens const& screens);

}  // namespace tzdraft
