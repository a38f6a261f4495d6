#pragma once

#include <cstdint>

// Where stacked text (a fraction or a tolerance) stands against its line: the values of the
// variable TSTACKALIGN and of the markup's code "\A".
enum VerticalAlignment : std::int32_t { kAlignBottom = 0, kAlignMiddle = 1, kAlignTop = 2 };
