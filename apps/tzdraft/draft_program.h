#pragma once

#include <functional>
#include <memory>
#include <string_view>

#include "apps/tzdraft/draft_options.h"
#include "host/command_line/answer_source.h"

// The program from its options to its exit status, also for tests, which run it in their own
// process: each run begins from scratch and leaves nothing that the next one could see.
namespace tzdraft {

struct Screens {
    std::function<void(std::string_view)> output;  // the transcript, UTF-8
    std::function<void(std::string_view)> errors;  // lines about what could not be done
    // Answers in place of the script; null for none.
    std::unique_ptr<tzhost::AnswerSource> source = nullptr;
    // What keeps the transcript from being written, which ends the session; empty while nothing
    // does.
    std::function<std::string()> outputProblem = [] { return std::string(); };
};

[[nodiscard]] int runProgram(Options const& options, Screens screens);

}  // namespace tzdraft
