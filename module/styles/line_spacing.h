#pragma once

#include "tz/db/mtext.h"
#include "tz/text/string.h"

// The line spacing of new texts, as the drawing keeps it, and the limits of a line spacing factor.
// At factor 1 the distance of two baselines is kSingleLineDistance text heights.

inline constexpr double kSingleLineDistance = 1.6666666666666667;
inline constexpr double kSmallestLineSpacingFactor = 0.25;
inline constexpr double kLargestLineSpacingFactor = 4.0;

// The variables TSPACEFAC and TSPACETYPE; a setter gives false when the host refused.
[[nodiscard]] double GetLineSpacingFactor();
[[nodiscard]] bool SetLineSpacingFactor(double factor);
[[nodiscard]] TzDb::LineSpacingStyle GetLineSpacingStyle();
[[nodiscard]] bool SetLineSpacingStyle(TzDb::LineSpacingStyle style);

// Whether a factor lies within the limits, both included; false for NaN.
[[nodiscard]] bool ValidateLineSpacingFactor(double factor);
// Pulls a factor onto the limit that it misses only because the limit, shown as a distance in the
// drawing's units and read back, is rounded. `textHeight` in drawing units.
void FixLineSpacingFactor(double& factor, double textHeight);
// Says within which distances and factors an answer must lie.
[[nodiscard]] TzString InvalidSpacingFactorMessage(double textHeight);
