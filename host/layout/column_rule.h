#pragma once

#include <cstddef>
#include <vector>

#include "host/layout/text_line.h"

// Stacks lines into columns: which column each line falls into and where its baseline lies.
namespace tzhost {

// The distance of baselines. At least: 5/3 of the line's height times the factor, and room for what
// reaches beyond capitals and baseline. Exactly: 5/3 of the text's height times the factor, always.
struct SpacingRule {
    bool exactly = false;
    double factor = 1.0;
    double textHeight = 0.0;

    [[nodiscard]] double distance(LineMetrics const& above, LineMetrics const& line) const;
};

// The rule of an MTEXT; a factor that is not above 0 counts as 1.
[[nodiscard]] SpacingRule spacingRuleOf(MTextLayoutInput const& input);

// How high each column is. A height of 0 or below has no limit; columns after the list are as high
// as `height`. The last of `most` columns takes all that is left; a `most` of 0 allows any number.
struct ColumnRule {
    std::vector<double> heights;
    double height = 0.0;
    std::size_t most = 1;
};

// A line's column, from 0, and its baseline below the columns' top (a number of 0 or below).
struct PlacedLine {
    std::size_t column = 0;
    double baseline = 0.0;
};

struct PlacedLines {
    std::vector<PlacedLine> lines;
    std::size_t columns = 0;
    double height = 0.0;  // of the fullest column
};

// Every column takes one line at the least, so that a line higher than its column still stands.
[[nodiscard]] PlacedLines placeLines(std::vector<LineMetrics> const& lines,
                                     SpacingRule const& spacing,
                                     ColumnRule const& rule);

// The rule for an MTEXT of that many lines. Static columns without a height share the lines evenly.
[[nodiscard]] ColumnRule columnRuleOf(MTextLayoutInput const& input,
                                      std::vector<LineMetrics> const& lines,
                                      SpacingRule const& spacing);

}  // namespace tzhost
