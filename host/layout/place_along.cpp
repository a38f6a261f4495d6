#include <algorithm>

#include "host/layout/attachment_box.h"
#include "host/layout/column_rule.h"
#include "host/layout/line_drawing.h"
#include "host/layout/line_placing.h"

namespace tzhost {
namespace {

LineMetrics metricsOf(BrokenText const& broken, LaidLine const& laid) {
    Segment const& segment = broken.segmentOf(laid);
    LineMetrics metrics;
    for (LineFragment const& fragment : laid.line.fragments) {
        SegmentCell const& cell = segment.cells[fragment.start];
        metrics.height = std::max(metrics.height, broken.formats[cell.format].height);
        if (cell.stack != 0) {
            LaidStack const& stack = segment.stacks[cell.stack - 1];
            metrics.ascent = std::max(metrics.ascent, stack.top);
            metrics.depth = std::max(metrics.depth, -stack.bottom);
        }
    }
    if (laid.line.fragments.empty()) {
        metrics.height = broken.formats[segment.endFormat].height;
    }
    metrics.ascent = std::max(metrics.ascent, metrics.height);
    return metrics;
}

// The width of all columns with the gutters between them. Static columns count used or not.
double columnsWidth(LayoutColumns const& columns, std::size_t used, double width) {
    auto const count = columns.type == LayoutColumns::kStatic
                           ? static_cast<double>(std::max(columns.count, 1))
                           : static_cast<double>(used);
    return count * width + (count - 1.0) * columns.gutter;
}

}  // namespace

MTextLayout placeAlong(MTextLayoutInput const& input, BrokenText const& broken) {
    std::vector<LineMetrics> metrics(broken.lines.size());
    std::ranges::transform(broken.lines, metrics.begin(),
                           [&](LaidLine const& laid) { return metricsOf(broken, laid); });
    SpacingRule const spacing = spacingRuleOf(input);
    PlacedLines const placed = placeLines(metrics, spacing, columnRuleOf(input, metrics, spacing));

    AttachmentShares const shares = attachmentShares(input.attachment, input.style);
    LineFrame const frame = frameOf(broken, shares.along);
    bool const hasColumns = input.columns.type != LayoutColumns::kNone;
    MTextLayout layout;
    layout.width = hasColumns ? columnsWidth(input.columns, placed.columns, frame.width)
                              : frame.measure(broken.lines);
    layout.height = placed.height;
    layout.box = boxAt(shares, layout.width, layout.height);
    double const left = hasColumns ? layout.box.left : -shares.along * frame.width;
    for (std::size_t i = 0; i < broken.lines.size(); ++i) {
        LaidLine const& laid = broken.lines[i];
        std::size_t const column = placed.lines[i].column;
        double const columnLeft =
            left + static_cast<double>(column) * (frame.width + input.columns.gutter);
        LayoutPoint const origin{columnLeft + frame.offset(laid.line),
                                 layout.box.top + placed.lines[i].baseline};
        layout.lines.push_back({static_cast<int>(column), origin.x, origin.y, laid.line.advance});
        drawLine(broken.segmentOf(laid), laid.line, broken.formats, broken.whole, origin, layout);
    }
    return layout;
}

}  // namespace tzhost
