#pragma once

#include <string>

namespace tzhost::drawingfile {

// The numbers that a member takes. All are finite.
enum class Range {
    any,
    positive,  // above 0
    size,      // 0 or more
    nonZero,
    spacing,      // 0.25 to 4
    enlargement,  // 1 to 5
};

// Whether a finite number lies in a range, and how a message names that range.
[[nodiscard]] bool isIn(Range range, double value);
[[nodiscard]] std::string nameOf(Range range);

// Whole numbers from `low` to `high`.
struct WholeRange {
    int low;
    int high;
};

}  // namespace tzhost::drawingfile
