#include "host/layout/column_rule.h"

#include <algorithm>

#include "host/layout/glyph_run.h"

namespace tzhost {
namespace {

constexpr double kLineDistance = 5.0 / 3.0;
constexpr double kSlack = 1e-9;

constexpr int kExactly = 2;

double limitOf(ColumnRule const& rule, std::size_t column) {
    bool const last = rule.most != 0 && column + 1 >= rule.most;
    if (last) {
        return 0.0;
    }
    return column < rule.heights.size() ? rule.heights[column] : rule.height;
}

// The height that puts an equal number of lines into each of `count` columns, the last taking
// fewer.
double
evenHeight(std::vector<LineMetrics> const& lines, SpacingRule const& spacing, std::size_t count) {
    std::size_t const share = (lines.size() + count - 1) / count;
    double highest = 0.0;
    for (std::size_t start = 0; start < lines.size(); start += share) {
        std::size_t const end = std::min(start + share, lines.size());
        double height = lines[start].ascent;
        for (std::size_t i = start + 1; i < end; ++i) {
            height += spacing.distance(lines[i - 1], lines[i]);
        }
        highest = std::max(highest, height + lines[end - 1].depth);
    }
    return highest;
}

}  // namespace

double SpacingRule::distance(LineMetrics const& above, LineMetrics const& line) const {
    if (exactly) {
        return kLineDistance * factor * textHeight;
    }
    return kLineDistance * factor * line.height + (line.ascent - line.height) + above.depth;
}

SpacingRule spacingRuleOf(MTextLayoutInput const& input) {
    return {input.lineSpacingStyle == kExactly, usableFactor(input.lineSpacingFactor),
            input.textHeight};
}

PlacedLines placeLines(std::vector<LineMetrics> const& lines,
                       SpacingRule const& spacing,
                       ColumnRule const& rule) {
    PlacedLines placed;
    std::size_t column = 0;
    double baseline = 0.0;
    for (std::size_t i = 0; i < lines.size(); ++i) {
        double const wanted =
            i == 0 ? lines[i].ascent : baseline + spacing.distance(lines[i - 1], lines[i]);
        double const limit = limitOf(rule, column);
        bool const full = i != 0 && limit > 0.0 && wanted + lines[i].depth > limit * (1.0 + kSlack);
        column += full ? 1 : 0;
        baseline = full ? lines[i].ascent : wanted;
        placed.lines.push_back({column, -baseline});
        placed.height = std::max(placed.height, baseline + lines[i].depth);
    }
    placed.columns = column + 1;
    return placed;
}

ColumnRule columnRuleOf(MTextLayoutInput const& input,
                        std::vector<LineMetrics> const& lines,
                        SpacingRule const& spacing) {
    LayoutColumns const& columns = input.columns;
    ColumnRule rule;
    rule.height = input.height;
    if (columns.type == LayoutColumns::kStatic) {
        rule.most = static_cast<std::size_t>(std::max(columns.count, 1));
        if (input.height <= 0.0) {
            rule.height = evenHeight(lines, spacing, rule.most);
        }
    } else if (columns.type == LayoutColumns::kDynamic) {
        rule.most = 0;
        if (!columns.autoHeight && !columns.heights.empty()) {
            rule.heights = columns.heights;
            rule.most = columns.heights.size();
        }
    }
    return rule;
}

}  // namespace tzhost
