#include "host/layout/mtext_layout.h"

#include <algorithm>
#include <cmath>
#include <numbers>

#include "host/layout/column_rule.h"
#include "host/layout/line_drawing.h"
#include "host/layout/line_filler.h"
#include "host/layout/segment_builder.h"

namespace tzhost {
namespace {

constexpr int kExactly = 2;
constexpr int kStaticColumns = 1;
constexpr double kTabHeights = 4.0;    // text heights between tab stops of a paragraph without any
constexpr double kMostOblique = 85.0;  // degrees; beyond it letters would be endless
constexpr double kDegree = std::numbers::pi / 180.0;

struct LaidLine {
    std::size_t segment = 0;
    SegmentLine line;
};

class Layouter {
public:
    explicit Layouter(MTextLayoutInput const& input);
    MTextLayout lay();

private:
    void breakLines();
    [[nodiscard]] LineMetrics metricsOf(LaidLine const& laid) const;
    [[nodiscard]] double lineOffset(SegmentLine const& line) const;
    void measureFrame(PlacedLines const& placed);
    void place(PlacedLines const& placed);

    MTextLayoutInput const& input_;
    MarkupText markup_;
    WholeText whole_;
    std::vector<LineFormat> formats_;
    std::vector<Segment> segments_;
    std::vector<LaidLine> lines_;
    bool hasColumns_;
    double wrapWidth_;
    double frameWidth_ = 0.0;  // what lines are aligned in
    double alignShare_;        // 0 left, 0.5 centre, 1 right
    double attachShare_;       // 0 top, 0.5 middle, 1 bottom
    MTextLayout result_;
};

// A factor that letters can be drawn with, or 1.
double usableFactor(double factor) {
    return factor > 0.0 && std::isfinite(factor) ? factor : 1.0;
}

WholeText wholeTextOf(MTextLayoutInput const& input, MarkupText const& markup) {
    WholeText whole;
    whole.widthFactor = usableFactor(markup.widthFactor) * usableFactor(input.style.widthFactor);
    whole.tracking = usableFactor(markup.tracking);
    double const most = kMostOblique * kDegree;
    whole.oblique = std::clamp(input.style.oblique + markup.oblique * kDegree, -most, most);
    whole.stackScale = input.stackScalePercent / 100.0;
    whole.tabDistance = kTabHeights * input.textHeight;
    return whole;
}

Layouter::Layouter(MTextLayoutInput const& input)
    : input_(input), markup_(readMarkup(input.contents, {0, input.textHeight, input.color})),
      whole_(wholeTextOf(input, markup_)), formats_(lineFormatsOf(markup_, input.style)),
      segments_(buildSegments(markup_, formats_, whole_)), hasColumns_(input.columns.type != 0),
      wrapWidth_(hasColumns_ && input.columns.width > 0.0 ? input.columns.width : input.width) {
    int const attachment = input.attachment >= 1 && input.attachment <= 9 ? input.attachment : 1;
    alignShare_ = ((attachment - 1) % 3) / 2.0;
    attachShare_ = ((attachment - 1) / 3) / 2.0;
}

MTextLayout Layouter::lay() {
    breakLines();
    std::vector<LineMetrics> metrics;
    metrics.reserve(lines_.size());
    for (LaidLine const& laid : lines_) {
        metrics.push_back(metricsOf(laid));
    }
    SpacingRule const spacing{input_.lineSpacingStyle == kExactly,
                              usableFactor(input_.lineSpacingFactor), input_.textHeight};
    PlacedLines const placed = placeLines(metrics, spacing, columnRuleOf(input_, metrics, spacing));
    measureFrame(placed);
    place(placed);
    return std::move(result_);
}

void Layouter::breakLines() {
    for (std::size_t i = 0; i < segments_.size(); ++i) {
        Segment& segment = segments_[i];
        for (SegmentLine& line :
             fillLines(segment, markup_.paragraphs[segment.paragraph], whole_, wrapWidth_)) {
            lines_.push_back({i, std::move(line)});
        }
    }
}

LineMetrics Layouter::metricsOf(LaidLine const& laid) const {
    Segment const& segment = segments_[laid.segment];
    LineMetrics metrics;
    for (LineFragment const& fragment : laid.line.fragments) {
        SegmentCell const& cell = segment.cells[fragment.start];
        metrics.height = std::max(metrics.height, formats_[cell.format].height);
        if (cell.stack != 0) {
            LaidStack const& stack = segment.stacks[cell.stack - 1];
            metrics.ascent = std::max(metrics.ascent, stack.top);
            metrics.depth = std::max(metrics.depth, -stack.bottom);
        }
    }
    if (laid.line.fragments.empty()) {
        metrics.height = formats_[segment.endFormat].height;
    }
    metrics.ascent = std::max(metrics.ascent, metrics.height);
    return metrics;
}

// Where a line starts within its frame.
double Layouter::lineOffset(SegmentLine const& line) const {
    return line.indent + alignShare_ * (frameWidth_ - line.indent - line.advance);
}

void Layouter::measureFrame(PlacedLines const& placed) {
    frameWidth_ = wrapWidth_;
    if (wrapWidth_ <= 0.0) {
        frameWidth_ = 0.0;
        for (LaidLine const& laid : lines_) {
            frameWidth_ = std::max(frameWidth_, laid.line.indent + laid.line.advance);
        }
    }
    double const centre = alignShare_ * frameWidth_;
    double before = 0.0;  // how far lines reach from the attachment point to either side
    double behind = 0.0;
    for (LaidLine const& laid : lines_) {
        double const offset = lineOffset(laid.line) - centre;
        before = std::max(before, -offset);
        behind = std::max(behind, offset + laid.line.advance);
    }
    result_.width = alignShare_ == 0.5   ? 2.0 * std::max(before, behind)
                    : alignShare_ == 0.0 ? behind
                                         : before;
    if (hasColumns_) {
        std::size_t const count = input_.columns.type == kStaticColumns
                                      ? static_cast<std::size_t>(std::max(input_.columns.count, 1))
                                      : placed.columns;
        result_.width = static_cast<double>(count) * frameWidth_ +
                        static_cast<double>(count - 1) * input_.columns.gutter;
    }
    result_.height = placed.height;
    result_.box.left = -alignShare_ * result_.width;
    result_.box.right = result_.box.left + result_.width;
    result_.box.top = attachShare_ * result_.height;
    result_.box.bottom = result_.box.top - result_.height;
}

void Layouter::place(PlacedLines const& placed) {
    double const left = hasColumns_ ? result_.box.left : -alignShare_ * frameWidth_;
    for (std::size_t i = 0; i < lines_.size(); ++i) {
        LaidLine const& laid = lines_[i];
        PlacedLine const& place = placed.lines[i];
        double const column = static_cast<double>(place.column);
        LayoutPoint const origin{left + column * (frameWidth_ + input_.columns.gutter) +
                                     lineOffset(laid.line),
                                 result_.box.top + place.baseline};
        result_.lines.push_back(
            {static_cast<int>(place.column), origin.x, origin.y, laid.line.advance});
        drawLine(segments_[laid.segment], laid.line, formats_, whole_, origin, result_);
    }
}

}  // namespace

MTextLayout layOutMText(MTextLayoutInput const& input) {
    return Layouter(input).lay();
}

LayoutBox backgroundBox(MTextLayout const& layout, double textHeight, double scale) {
    double const margin = (scale - 1.0) * textHeight;
    return {layout.box.left - margin, layout.box.bottom - margin, layout.box.right + margin,
            layout.box.top + margin};
}

}  // namespace tzhost
