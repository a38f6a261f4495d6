#include "host/layout/stack_layout.h"

#include <algorithm>
#include <array>
#include <utility>

#include "host/layout/glyph_run.h"
#include "host/layout/shaper.h"

namespace tzhost {
namespace {

// Proportions of a stack in heights of its parts: the baseline of the upper part above that of the
// lower one, and how far the bar reaches over the parts at either end.
struct StackProportions {
    double rise;
    double overhang;
};

// In the order of StackKind.
constexpr std::array<StackProportions, 3> kProportions{
    {
     {1.6, 0.1},
     {0.9, 0.1},
     {1.4, 0.0},
     }
};

// The bar of an over stack, and where a slash begins and ends, against the foot of the stack.
constexpr double kBarHeight = 1.3;
constexpr double kSlashWidth = 0.6;
constexpr double kSlashOverlap = 0.1;  // of each part over the slash

class StackMaker {
public:
    StackMaker(StackText const& stack, LineFormat const& format, WholeText const& whole);
    LaidStack lay() &&;

private:
    GlyphRun part(std::wstring const& text);
    void layOver();
    void layFraction();
    void layTolerance();
    void addRule(RuleKind kind, LayoutPoint from, LayoutPoint to);
    void align();

    StackText const& stack_;
    LineFormat const& format_;
    WholeText const& whole_;
    double height_;  // of the parts
    StackProportions proportions_;
    GlyphRun upper_;
    GlyphRun lower_;
    LaidStack laid_;
};

StackMaker::StackMaker(StackText const& stack, LineFormat const& format, WholeText const& whole)
    : stack_(stack), format_(format), whole_(whole), height_(format.height * whole.stackScale),
      proportions_(kProportions[static_cast<std::size_t>(stack.kind)]), upper_(part(stack.upper)),
      lower_(part(stack.lower)) {}

GlyphRun StackMaker::part(std::wstring const& text) {
    LineFormat format = format_;
    format.height = height_;
    GlyphRun run = makeGlyphRun(text, format, whole_);
    run.advance = shapedAdvance(text, format.face) * advanceScale(format, whole_);
    return run;
}

LaidStack StackMaker::lay() && {
    upper_.y = proportions_.rise * height_;
    switch (stack_.kind) {
    case StackKind::over: layOver(); break;
    case StackKind::fraction: layFraction(); break;
    case StackKind::tolerance: layTolerance(); break;
    }
    laid_.top = upper_.y + height_;
    for (GlyphRun* const run : {&upper_, &lower_}) {
        if (!run->text.empty()) {
            laid_.runs.push_back(std::move(*run));
        }
    }
    align();
    return std::move(laid_);
}

void StackMaker::layOver() {
    double const overhang = proportions_.overhang * height_;
    laid_.advance = std::max(upper_.advance, lower_.advance) + 2.0 * overhang;
    upper_.x = (laid_.advance - upper_.advance) / 2.0;
    lower_.x = (laid_.advance - lower_.advance) / 2.0;
    double const bar = kBarHeight * height_;
    addRule(RuleKind::stackBar, {0.0, bar}, {laid_.advance, bar});
}

void StackMaker::layFraction() {
    double const overlap = kSlashOverlap * height_;
    double const foot = std::max(upper_.advance - overlap, 0.0);
    double const head = foot + kSlashWidth * height_;
    lower_.x = head - overlap;
    laid_.advance = std::max(lower_.x + lower_.advance, head);
    addRule(RuleKind::stackSlash, {foot, 0.0}, {head, upper_.y + height_});
}

void StackMaker::layTolerance() {
    laid_.advance = std::max(upper_.advance, lower_.advance);
}

void StackMaker::addRule(RuleKind kind, LayoutPoint from, LayoutPoint to) {
    laid_.rules.push_back({kind, from, to, format_.color});
}

void StackMaker::align() {
    double const share = static_cast<double>(stack_.alignment) / 2.0;
    double const shift = share * (format_.height - laid_.top);
    laid_.top += shift;
    laid_.bottom += shift;
    for (GlyphRun& run : laid_.runs) {
        run.y += shift;
    }
    for (TextRule& rule : laid_.rules) {
        rule.from.y += shift;
        rule.to.y += shift;
    }
}

}  // namespace

LaidStack layStack(StackText const& stack, LineFormat const& format, WholeText const& whole) {
    return StackMaker(stack, format, whole).lay();
}

}  // namespace tzhost
