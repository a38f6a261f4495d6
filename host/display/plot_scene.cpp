#include "host/display/plot_scene.h"

#include <algorithm>
#include <cmath>
#include <utility>

#include "host/base/entity_drawing.h"
#include "host/display/plot_ink.h"
#include "host/layout/line_layout.h"

namespace tzhost {
namespace {

// How many points of each kind of step count, in the order of OutlineKind.
constexpr std::size_t kPointsOf[] = {1, 1, 3, 0};

std::size_t pointsOf(OutlineStep const& step) {
    return kPointsOf[static_cast<std::size_t>(step.kind)];
}

LayoutPoint flat(TzGePoint2d const& point) {
    return {point.x, point.y};
}

void addShapes(PlotScene& scene,
               ViewAxes const& axes,
               DrawPen const& pen,
               DrawnLines const& lines) {
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
    scene.shapes.push_back(std::move(shape));
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

private:
    TzGePoint2d origin_;
    TzGeVector2d along_;
    TzGeVector2d up_;
};

void addShapes(PlotScene& scene, ViewAxes const& axes, DrawPen const& pen, DrawnText const& text) {
    TextFrame const frame(text, axes);
    PlotShape shape;
    shape.kind = PlotKind::fill;
    for (GlyphRun const& run : layOutLine(layoutInputOf(text)).runs) {
        for (OutlineStep step : textOutline(run)) {
            for (std::size_t i = 0; i < pointsOf(step); ++i) {
                step.points[i] = frame.place(step.points[i]);
            }
            shape.path.push_back(step);
        }
    }
    // Letters are strokes as far as colours go, whatever the fill type for outlines is.
    shape.color = inkOf(pen, PlotKind::stroke);
    if (!shape.path.empty()) scene.shapes.push_back(std::move(shape));
}

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

// A plot draws entities stroke by stroke, so none comes whole.
void addShapes(PlotScene& /*scene*/,
               ViewAxes const& /*axes*/,
               DrawPen const& /*pen*/,
               DrawnEntity const& /*entity*/) {}

}  // namespace

std::optional<LayoutBox> PlotScene::extents() const {
    BoxBuilder builder;
    for (PlotShape const& shape : shapes) {
        // A move counts when something is drawn from there: outlines of letters hold idle ones. But
        // a path that is no more than a move is a dot.
        std::optional<LayoutPoint> start;
        for (OutlineStep const& step : shape.path) {
            if (step.kind == OutlineKind::move) {
                start = step.points[0];
                continue;
            }
            if (start) builder.add(*std::exchange(start, std::nullopt));
            for (std::size_t i = 0; i < pointsOf(step); ++i)
                builder.add(step.points[i]);
        }
        if (start && shape.path.size() == 1) builder.add(*start);
    }
    return builder.box;
}

PlotScene makeScene(DrawList const& list, ViewAxes const& axes) {
    PlotScene scene;
    for (DrawOp const& op : list) {
        std::visit([&](auto const& what) { addShapes(scene, axes, op.pen, what); }, op.what);
    }
    return scene;
}

}  // namespace tzhost
