#pragma once

#include <filesystem>
#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "host/command_line/answer_source.h"
#include "host/faults/fault_plan.h"

// Plays a script in one process and plays each command of the module in it again and again: with
// each question in turn, and every later one, cancelled; and with each call of each host operation
// failing. Whatever a try does is taken back before the next.
namespace tztest {

// What was left over after one try.
struct SweepTry {
    std::string command;
    std::string what;  // "cancel from question 3", "tzedSSGet:2"
    bool auditIsClean = true;
    bool onlyHighlightingIsLeft = false;  // when it is not clean
    bool drawingIsValid = true;           // it can be saved and read again
    bool drawingIsUntouched = true;       // but for the last point
};

struct SweepCounts {
    long commands = 0;
    long questions = 0;
    long calls = 0;
    long tries = 0;
};

enum class Sweep { cancels, faults };

// How many of an operation's calls are tried: all up to `allUpTo`, then every one of a seeded
// sample.
struct SweepDepth {
    long allUpTo = 50;
    long sampleBeyond = 20;
};

// A script and the drawing that it is played on; without one on an empty drawing.
struct SweepInput {
    std::string script;
    std::filesystem::path drawing;
};

// Hands every try to `judge` and returns the counts.
SweepCounts sweepScript(SweepInput const& input,
                        Sweep kind,
                        SweepDepth depth,
                        std::function<void(SweepTry const&)> const& judge);

}  // namespace tztest
