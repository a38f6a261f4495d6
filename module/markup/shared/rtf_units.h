#pragma once

// Numbers of rich text that both directions know.

// Sizes are half-points, which are tens of twips in this system.
inline constexpr int kTwipsPerHalfPoint = 10;
// A baseline shift that stands around the marks of a stack and is no shift.
inline constexpr int kStackMarker = 1234;
