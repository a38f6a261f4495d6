#include "host/display/plot_scene.h"

#include <algorithm>
#include <cmath>
#include <memory>
#include <utility>

#include "host/base/entity_drawing.h"
#include "host/base/job.h"
#include "host/display/plot_ink.h"
#include "host/layout/line_layout.h"
#include "host/text/local_text.h"

namespace tzhost {
namespace {

LayoutPoint flat(TzGePoint2d const& point) {
    return {point.x, point.y};
}

void eachShape(DrawnLines const& lines,
               ViewAxes const& axes,
               DrawPen const& pen,
               ShapeTaker const& take) {
    PlotShape shape;
    shape.kind = lines.closed && pen.fill != kFillNothing ? PlotKind::fill : PlotKind::stroke;
    OutlineKind next = OutlineKind::move;
    for (TzGePoint3d const& each : lines.points) {
        shape.path.push_back({next, {flat(axes.project(each))}});
        next = OutlineKind::line;
    }
    if (lines.closed) shape.path.push_back({OutlineKind::close, {}});
    shape.color = inkOf(pen, shape.kind);
    shape.lineWeight = lineWeightOf(pen);
    shape.dashes = dashesOf(pen);
    take(shape);
}

LineLayoutInput layoutInputOf(DrawnText const& text) {
    LineLayoutInput input;
    TzGiTextStyle const& style = text.style;
    input.text = text.raw ? text.text.str() : decodeLineText(text.text.str());
    input.textHeight = style.textSize();
    input.tracking = style.trackingPercent();
    input.style.fontFile = style.fileName().str();
    input.style.bigFontFile = style.bigFontFileName().str();
    input.style.typeface = style.typeface().str();
    input.style.bold = style.isBold();
    input.style.italic = style.isItalic();
    input.style.charset = style.charset();
    input.style.pitchAndFamily = style.pitchAndFamily();
    input.style.widthFactor = style.xScale();
    input.style.oblique = style.obliquingAngle();
    input.style.vertical = style.isVertical();
    input.style.backward = style.isBackward();
    input.style.upsideDown = style.isUpsideDown();
    dropVerticalMark(input.style);
    return input;
}

// Brings points of a text's own frame into the view.
class TextFrame {
public:
    TextFrame(DrawnText const& text, ViewAxes const& axes)
        : origin_(axes.project(text.position)), along_(axes.project(text.direction.normal())),
          up_(axes.project(text.normal.crossProduct(text.direction).normal())) {}

    [[nodiscard]] LayoutPoint place(LayoutPoint const& point) const {
        return flat(origin_ + along_ * point.x + up_ * point.y);
    }
    [[nodiscard]] LayoutPoint turn(LayoutPoint const& step) const {
        return flat(TzGePoint2d() + along_ * step.x + up_ * step.y);
    }

private:
    TzGePoint2d origin_;
    TzGeVector2d along_;
    TzGeVector2d up_;
};

// Collects the letters of a run into shapes.
class LetterShapes {
public:
    LetterShapes(TextFrame const& frame, DrawPen const& pen, ShapeTaker const& take)
        : frame_(frame), take_(take) {
        shape_.kind = PlotKind::fill;
        // Letters are strokes as far as colours go, whatever the fill type for outlines is.
        shape_.color = inkOf(pen, PlotKind::stroke);
    }

    void startRun(GlyphRun const& run) {
        shape_.letterHeight = run.height;
        constexpr std::size_t kMostBytes = 4;  // of a character
        first_ = next_;
        next_ += kMostBytes * run.text.size();
    }
    void add(OutlinedLetter const& letter);
    void flush();

private:
    // A run of any length goes to the page in shapes of so many letters.
    static constexpr int kLettersOfAShape = 1000;

    TextFrame const& frame_;
    ShapeTaker const& take_;
    PlotShape shape_;
    int letters_ = 0;
    std::size_t first_ = 0;  // the place of the run among all characters
    std::size_t next_ = 0;
};

void LetterShapes::add(OutlinedLetter const& letter) {
    // Glyphs that stand for the same characters stay together.
    if (letters_ >= kLettersOfAShape && !letter.text.empty()) flush();
    if (letters_ == 0) shape_.from = frame_.place(letter.start);
    shape_.to = frame_.place(letter.end);
    for (OutlineStep step : letter.steps) {
        for (std::size_t i = 0; i < step.pointCount(); ++i)
            step.points[i] = frame_.place(step.points[i]);
        shape_.path.push_back(step);
    }
    shape_.glyphs.push_back({letter.font, letter.glyph, frame_.place(letter.origin),
                             frame_.turn(letter.along), frame_.turn(letter.down), letter.text,
                             first_ + letter.at, letter.rightToLeft, letter.spread});
    ++letters_;
}

void LetterShapes::flush() {
    if (!shape_.path.empty()) take_(shape_);
    shape_.path.clear();
    shape_.glyphs.clear();
    letters_ = 0;
}

void eachShape(DrawnText const& text,
               ViewAxes const& axes,
               DrawPen const& pen,
               ShapeTaker const& take) {
    TextFrame const frame(text, axes);
    LetterShapes shapes(frame, pen, take);
    for (GlyphRun const& run : layOutLine(layoutInputOf(text)).runs) {
        shapes.startRun(run);
        outlineLetters(run, [&](OutlinedLetter const& letter) { shapes.add(letter); });
    }
    shapes.flush();
}

// A plot draws entities stroke by stroke, so none comes whole.
void eachShape(DrawnEntity const& /*entity*/,
               ViewAxes const& /*axes*/,
               DrawPen const& /*pen*/,
               ShapeTaker const& /*take*/) {}

struct BoxBuilder {
    std::optional<LayoutBox> box;

    void add(LayoutPoint const& point) {
        auto const [x, y] = point;
        if (!std::isfinite(x) || !std::isfinite(y)) return;
        if (!box) box = LayoutBox{x, y, x, y};
        *box = {std::min(box->left, x), std::min(box->bottom, y), std::max(box->right, x),
                std::max(box->top, y)};
    }
};

void addTo(BoxBuilder& builder, PlotShape const& shape) {
    // A move counts when something is drawn from there: outlines of letters hold idle ones. But a
    // path that is no more than a move is a dot.
    std::optional<LayoutPoint> start;
    for (OutlineStep const& step : shape.path) {
        if (step.kind == OutlineKind::move) {
            start = step.points[0];
            continue;
        }
        if (start) builder.add(*std::exchange(start, std::nullopt));
        for (std::size_t i = 0; i < step.pointCount(); ++i)
            builder.add(step.points[i]);
    }
    if (start && shape.path.size() == 1) builder.add(*start);
}

}  // namespace

std::optional<LayoutBox> extentsOf(PlotScene const& scene) {
    Job const job(localText(L"Measuring"));
    BoxBuilder builder;
    scene([&](PlotShape const& shape) { addTo(builder, shape); });
    return builder.box;
}

PlotScene makeScene(DrawList list, ViewAxes const& axes) {
    auto const kept = std::make_shared<DrawList const>(std::move(list));
    return [kept, axes](ShapeTaker const& take) {
        Job const job(nullptr, kept->size());
        for (DrawOp const& op : *kept) {
            Job::step();
            std::visit([&](auto const& what) { eachShape(what, axes, op.pen, take); }, op.what);
        }
    };
}

}  // namespace tzhost
