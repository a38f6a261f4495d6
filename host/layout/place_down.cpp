#include <algorithm>

#include "host/layout/attachment_box.h"
#include "host/layout/column_rule.h"
#include "host/layout/glyph_run.h"
#include "host/layout/line_drawing.h"
#include "host/layout/line_placing.h"

namespace tzhost {
namespace {

// A line that runs down counts by its middle, with half its letters' height to either side.
LineMetrics metricsOf(BrokenText const& broken, LaidLine const& laid) {
    Segment const& segment = broken.segmentOf(laid);
    LineMetrics metrics;
    for (LineFragment const& fragment : laid.line.fragments) {
        SegmentCell const& cell = segment.cells[fragment.start];
        metrics.height = std::max(metrics.height, broken.formats[cell.format].height);
    }
    if (laid.line.fragments.empty()) {
        metrics.height = broken.formats[segment.endFormat].height;
    }
    metrics.ascent = metrics.height / 2.0;
    metrics.depth = metrics.height / 2.0;
    return metrics;
}

// Draws a line down from `top`, its letters centred on the line's middle.
void drawDown(BrokenText const& broken,
              LaidLine const& laid,
              LayoutPoint top,
              MTextLayout& layout) {
    Segment const& segment = broken.segmentOf(laid);
    for (std::size_t i = laid.line.start; i < laid.line.end;) {
        SegmentCell const& cell = segment.cells[i];
        LineFormat const& format = broken.formats[cell.format];
        std::size_t const start = i;
        double width = 0.0;
        do {
            width += segment.cells[i].width;
            ++i;
        } while (i < laid.line.end && !segment.cells[i].opensLetter);
        double const gap = (kVerticalStep - 1.0) * format.height / 2.0;
        LayoutPoint const corner{top.x - width / 2.0, top.y - gap};
        top.y -= cell.advance;
        if (cell.stack != 0) {
            LaidStack const& stack = segment.stacks[cell.stack - 1];
            drawStack(stack, {corner.x, corner.y - stack.top}, layout);
        } else if (!cell.isBlank) {
            GlyphRun run =
                makeGlyphRun(segment.text.substr(start, i - start), format, broken.whole);
            run.x = corner.x;
            run.y = corner.y - format.height;
            run.advance = width;
            layout.runs.push_back(std::move(run));
        }
    }
}

}  // namespace

MTextLayout placeDown(MTextLayoutInput const& input, BrokenText const& broken) {
    std::vector<LineMetrics> metrics(broken.lines.size());
    std::ranges::transform(broken.lines, metrics.begin(),
                           [&](LaidLine const& laid) { return metricsOf(broken, laid); });
    PlacedLines const placed = placeLines(metrics, spacingRuleOf(input), {{}, 0.0, 1});

    AttachmentShares const shares = attachmentShares(input.attachment, input.style);
    LineFrame const frame = frameOf(broken, shares.down);
    MTextLayout layout;
    layout.width = placed.height;
    layout.height = frame.measure(broken.lines);
    layout.box = boxAt(shares, layout.width, layout.height);
    double const top = shares.down * frame.width;
    for (std::size_t i = 0; i < broken.lines.size(); ++i) {
        LaidLine const& laid = broken.lines[i];
        LayoutPoint const origin{layout.box.right + placed.lines[i].baseline,
                                 top - frame.offset(laid.line)};
        layout.lines.push_back({0, origin.x, origin.y, laid.line.advance});
        drawDown(broken, laid, origin, layout);
    }
    return layout;
}

}  // namespace tzhost
