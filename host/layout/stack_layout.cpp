#include "host/layout/stack_layout.h"

#include <algorithm>
#include <array>
#include <utility>

#include "host/layout/glyph_run.h"

namespace tzhost {
namespace {

// Proportions in heights of the parts: the room at either end of a stack, which an over bar fills,
// the bar's place above the foot, and the slash, which each part reaches over by an overlap.
constexpr double kMargin = 0.1;
constexpr double kBarHeight = 1.3;
constexpr double kSlashWidth = 0.6;
constexpr double kSlashOverlap = 0.1;

class StackMaker {
public:
    StackMaker(StackText const& stack, LineFormat const& format, WholeText const& whole);
    LaidStack lay() &&;

    // What each kind does with the parts within the margins.
    void layOver();
    void layFraction();
    void layTolerance();

private:
    GlyphRun part(std::wstring const& text);
    void addRule(RuleKind kind, LayoutPoint from, LayoutPoint to);
    void align();

    StackText const& stack_;
    LineFormat const& format_;
    WholeText const& whole_;
    double height_;  // of the parts
    double margin_;
    GlyphRun upper_;
    GlyphRun lower_;
    LaidStack laid_;
};

// How high the upper part's baseline lies above the lower one's, in heights of the parts.
struct KindRow {
    double rise;
    void (StackMaker::*lay)();
};

// In the order of StackKind.
constexpr std::array kKinds{
    KindRow{1.6, &StackMaker::layOver},
    KindRow{0.9, &StackMaker::layFraction},
    KindRow{1.4, &StackMaker::layTolerance},
};

StackMaker::StackMaker(StackText const& stack, LineFormat const& format, WholeText const& whole)
    : stack_(stack), format_(format), whole_(whole), height_(format.height * whole.stackScale),
      margin_(kMargin * height_), upper_(part(stack.upper)), lower_(part(stack.lower)) {}

GlyphRun StackMaker::part(std::wstring const& text) {
    LineFormat format = format_;
    format.height = height_;
    return shapeGlyphRun(text, format, whole_);
}

LaidStack StackMaker::lay() && {
    KindRow const& kind = kKinds[static_cast<std::size_t>(stack_.kind)];
    upper_.y = kind.rise * height_;
    (this->*kind.lay)();
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
    laid_.advance = std::max(upper_.advance, lower_.advance) + 2.0 * margin_;
    upper_.x = (laid_.advance - upper_.advance) / 2.0;
    lower_.x = (laid_.advance - lower_.advance) / 2.0;
    double const bar = kBarHeight * height_;
    addRule(RuleKind::stackBar, {0.0, bar}, {laid_.advance, bar});
}

void StackMaker::layFraction() {
    double const overlap = kSlashOverlap * height_;
    upper_.x = margin_;
    double const foot = margin_ + std::max(upper_.advance - overlap, 0.0);
    double const head = foot + kSlashWidth * height_;
    lower_.x = head - overlap;
    laid_.advance = std::max(lower_.x + lower_.advance, head) + margin_;
    addRule(RuleKind::stackSlash, {foot, 0.0}, {head, upper_.y + height_});
}

void StackMaker::layTolerance() {
    upper_.x = margin_;
    lower_.x = margin_;
    laid_.advance = std::max(upper_.advance, lower_.advance) + 2.0 * margin_;
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
