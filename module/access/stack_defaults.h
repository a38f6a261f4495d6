#pragma once

#include <cstdint>

// How stacked text (fractions and tolerances) begins: its size and place, as the drawing keeps
// them.

// Where a stack stands against its line.
enum VerticalAlignment : std::int32_t { kAlignBottom = 0, kAlignMiddle = 1, kAlignTop = 2 };

// Per cent of the text height, the variable TSTACKSIZE; the setter gives false when the host
// refused.
[[nodiscard]] int GetDefaultStackScale();
[[nodiscard]] bool SetDefaultStackScale(int percent);
// The variable TSTACKALIGN.
[[nodiscard]] VerticalAlignment GetDefaultStackAlignment();
[[nodiscard]] bool SetDefaultStackAlignment(VerticalAlignment alignment);
