#include "host/layout/line_drawing.h"

#include <algorithm>
#include <array>

#include "host/layout/glyph_run.h"

namespace tzhost {
namespace {

struct DecorationRow {
    RuleKind kind;
    bool LineFormat::*wanted;
    double offset;  // from the baseline, in text heights
};

constexpr std::array<DecorationRow, 2> kDecorations{{
    {RuleKind::underline, &LineFormat::underline, -0.2},
    {RuleKind::overline, &LineFormat::overline, 1.2},
}};

// A decoration that is being drawn out along the line.
struct OpenRule {
    bool open = false;
    double from = 0.0;
    double to = 0.0;
    double height = 0.0;
    TextColor color;
};

class LineDrawer {
public:
    LineDrawer(Segment const& segment,
               std::vector<LineFormat> const& formats,
               WholeText const& whole,
               LayoutPoint origin,
               MTextLayout& layout)
        : segment_(segment), formats_(formats), whole_(whole), origin_(origin), layout_(layout) {}

    void draw(SegmentLine const& line);

private:
    void drawText(LineFragment const& fragment, LineFormat const& format);
    void decorate(DecorationRow const& row,
                  OpenRule& rule,
                  LineFragment const& fragment,
                  LineFormat const& format);
    void close(DecorationRow const& row, OpenRule& rule);

    Segment const& segment_;
    std::vector<LineFormat> const& formats_;
    WholeText const& whole_;
    LayoutPoint origin_;
    MTextLayout& layout_;
};

void LineDrawer::draw(SegmentLine const& line) {
    std::array<OpenRule, kDecorations.size()> rules;
    for (LineFragment const& fragment : line.fragments) {
        SegmentCell const& cell = segment_.cells[fragment.start];
        LineFormat const& format = formats_[cell.format];
        for (std::size_t i = 0; i < rules.size(); ++i) {
            decorate(kDecorations[i], rules[i], fragment, format);
        }
        if (cell.stack != 0) {
            drawStack(segment_.stacks[cell.stack - 1], {origin_.x + fragment.x, origin_.y},
                      layout_);
        } else if (segment_.text[fragment.start] != L'\t') {
            drawText(fragment, format);
        }
    }
    for (std::size_t i = 0; i < rules.size(); ++i) {
        close(kDecorations[i], rules[i]);
    }
}

void LineDrawer::drawText(LineFragment const& fragment, LineFormat const& format) {
    GlyphRun run = makeGlyphRun(segment_.text.substr(fragment.start, fragment.end - fragment.start),
                                format, whole_);
    run.rightToLeft = fragment.level % 2 != 0;
    run.x = origin_.x + fragment.x;
    run.y = origin_.y;
    run.advance = fragment.advance;
    layout_.runs.push_back(std::move(run));
}

void LineDrawer::decorate(DecorationRow const& row,
                          OpenRule& rule,
                          LineFragment const& fragment,
                          LineFormat const& format) {
    bool const wanted = format.*row.wanted;
    if (rule.open && (!wanted || !(rule.color == format.color))) {
        close(row, rule);
    }
    if (!wanted) {
        return;
    }
    if (!rule.open) {
        rule = {true, fragment.x, fragment.x, 0.0, format.color};
    }
    rule.to = fragment.x + fragment.advance;
    rule.height = std::max(rule.height, format.height);
}

void LineDrawer::close(DecorationRow const& row, OpenRule& rule) {
    if (!rule.open) {
        return;
    }
    double const y = origin_.y + row.offset * rule.height;
    layout_.rules.push_back(
        {row.kind, {origin_.x + rule.from, y}, {origin_.x + rule.to, y}, rule.color});
    rule.open = false;
}

}  // namespace

void drawStack(LaidStack const& stack, LayoutPoint origin, MTextLayout& layout) {
    for (GlyphRun run : stack.runs) {
        run.x += origin.x;
        run.y += origin.y;
        layout.runs.push_back(std::move(run));
    }
    for (TextRule rule : stack.rules) {
        for (LayoutPoint* const point : {&rule.from, &rule.to}) {
            point->x += origin.x;
            point->y += origin.y;
        }
        layout.rules.push_back(rule);
    }
}

void drawLine(Segment const& segment,
              SegmentLine const& line,
              std::vector<LineFormat> const& formats,
              WholeText const& whole,
              LayoutPoint origin,
              MTextLayout& layout) {
    LineDrawer(segment, formats, whole, origin, layout).draw(line);
}

}  // namespace tzhost
