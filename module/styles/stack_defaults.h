#pragma once

#include "tz/mte/stack_alignment.h"

// How stacked text (fractions and tolerances) begins: its size and place, as the drawing keeps
// them.

// Per cent of the text height, the variable TSTACKSIZE; the setter gives false when the host
// refused.
[[nodiscard]] int GetDefaultStackScale();
[[nodiscard]] bool SetDefaultStackScale(int percent);
// The variable TSTACKALIGN.
[[nodiscard]] VerticalAlignment GetDefaultStackAlignment();
[[nodiscard]] bool SetDefaultStackAlignment(VerticalAlignment alignment);
