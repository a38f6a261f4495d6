#include "host/layout/mtext_layout.h"

#include <algorithm>
#include <numbers>

#include "host/layout/glyph_run.h"
#include "host/layout/line_filler.h"
#include "host/layout/line_layout.h"
#include "host/layout/line_placing.h"
#include "host/layout/segment_builder.h"

namespace tzhost {
namespace {

constexpr double kTabHeights = 4.0;  // text heights between tab stops of a paragraph without any
constexpr double kDegree = std::numbers::pi / 180.0;

WholeText wholeTextOf(MTextLayoutInput const& input, MarkupText const& markup) {
    WholeText whole;
    whole.widthFactor = usableFactor(markup.widthFactor) * usableFactor(input.style.widthFactor);
    whole.tracking = usableFactor(markup.tracking);
    whole.oblique = usableSlant(input.style.oblique + markup.oblique * kDegree);
    whole.stackScale = usableFactor(input.stackScalePercent / 100.0);
    whole.tabDistance = kTabHeights * input.textHeight;
    whole.flow = isVerticalStyle(input.style) ? TextFlow::down : TextFlow::along;
    return whole;
}

BrokenText breakText(MTextLayoutInput const& input) {
    MarkupText const markup = readMarkup(input.contents, {0, input.textHeight, input.color});
    BrokenText broken;
    broken.whole = wholeTextOf(input, markup);
    bool const columns = input.columns.type != LayoutColumns::kNone && input.columns.width > 0.0 &&
                         broken.whole.flow == TextFlow::along;
    broken.wrapWidth = columns ? input.columns.width : input.width;
    broken.formats = lineFormatsOf(markup, input.style);
    broken.segments = buildSegments(markup, broken.formats, broken.whole);
    for (std::size_t i = 0; i < broken.segments.size(); ++i) {
        Segment& segment = broken.segments[i];
        for (SegmentLine& line : fillLines(segment, markup.paragraphs[segment.paragraph],
                                           broken.whole, broken.wrapWidth)) {
            broken.lines.push_back({i, std::move(line)});
        }
    }
    return broken;
}

}  // namespace

MTextLayout layOutMText(MTextLayoutInput const& input) {
    BrokenText const broken = breakText(input);
    return broken.whole.flow == TextFlow::down ? placeDown(input, broken)
                                               : placeAlong(input, broken);
}

LayoutBox backgroundBox(MTextLayout const& layout, double textHeight, double scale) {
    double const margin = (scale - 1.0) * textHeight;
    return {layout.box.left - margin, layout.box.bottom - margin, layout.box.right + margin,
            layout.box.top + margin};
}

}  // namespace tzhost
