#pragma once

#include <string>

#include "host/layout/text_line.h"

// Lays out a stacked text: two parts over each other with a bar (over), beside a slash (fraction),
// or over each other without anything (tolerance).
namespace tzhost {

struct StackText {
    std::wstring upper;
    std::wstring lower;
    StackKind kind = StackKind::over;
    StackAlignment alignment = StackAlignment::bottom;
};

// Lays a stack out. Its foot stands on the baseline, its middle at half the height of the capitals
// beside it, or its top at their top, by its alignment. The parts of an over stack are centred upon
// each other, those of a tolerance begin at one edge.
[[nodiscard]] LaidStack
layStack(StackText const& stack, LineFormat const& format, WholeText const& whole);

}  // namespace tzhost
