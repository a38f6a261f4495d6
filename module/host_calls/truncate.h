#pragma once

// Reals as integers, without the undefined corners of a plain conversion.

// The integer that `value` has without its decimals; the nearest int when it does not fit, 0 for
// NaN.
[[nodiscard]] int truncatedToInt(double value);
