#include "host/display/draw_pass.h"

#include <algorithm>
#include <cmath>
#include <numbers>
#include <utility>

#include "host/display/shown.h"
#include "tz/db/entity.h"
#include "tz/ge/arbitrary_axis.h"

namespace tzhost {
namespace {

// Drawables that draw each other deeper than this are drawn no further.
constexpr int kDeepest = 64;
constexpr int kCircleSides = 128;

bool isHidden(TzGiDrawable const& drawable) {
    auto const* const entity = dynamic_cast<TzDbEntity const*>(&drawable);
    return entity && !isShown(*entity);
}

// The pen that a drawable inside another starts with: everything as its layer, and what it says "as
// the block" as the one around it.
DrawPen penWithin(DrawPen const& outer) {
    DrawPen pen;
    bool const passesOn = outer.color.isByBlock();
    pen.blockColor = passesOn ? outer.blockColor : outer.color;
    pen.blockLayer = passesOn ? outer.blockLayer : outer.layer;
    pen.layer = outer.layer;
    return pen;
}

std::vector<TzGePoint3d> pointsOf(int count, TzGePoint3d const* points) {
    return count > 0 && points ? std::vector<TzGePoint3d>(points, points + count)
                               : std::vector<TzGePoint3d>();
}

}  // namespace

DrawPass::DrawPass(TzDbDatabase* database, Entities entities)
    : entities_(entities), context_(database) {}

void DrawPass::draw(TzGiDrawable* drawable) {
    if (!drawable) return;
    TzGiDrawable const* const before = std::exchange(top_, drawable);
    traits_.setPen(DrawPen());
    drawNested(*drawable);
    top_ = before;
}

void DrawPass::drawNested(TzGiDrawable& drawable) {
    if (depth_ >= kDeepest || !isWhole() || isHidden(drawable)) return;
    ++depth_;
    DrawPen const outer = traits_.pen();
    traits_.setPen(penWithin(outer));
    drawable.setAttributes(&traits_);
    if (!drawable.worldDraw(&world_)) drawable.viewportDraw(&viewport_);
    traits_.setPen(outer);
    --depth_;
}

bool DrawPass::take(TzDbEntity const& entity, wchar_t const* type, TzGePoint3d const& position) {
    if (entities_ == Entities::strokes || &entity == top_) return false;
    list_.push_back({traits_.pen(), DrawnEntity{type, transform() * position}});
    return true;
}

void DrawPass::addLines(DrawnLines lines) {
    if (lines.points.empty()) return;
    for (TzGePoint3d& each : lines.points)
        each.transformBy(transform());
    list_.push_back({traits_.pen(), std::move(lines)});
}

void DrawPass::place(DrawnText& text) const {
    if (transforms_.empty()) return;
    TzGeMatrix3d const& matrix = transforms_.back();
    TzGeVector3d const along = matrix * text.direction.normal();
    // The normal stays upright on the text's plane, which a skew turns otherwise than a vector.
    TzGeVector3d const up = matrix * text.normal.crossProduct(text.direction);
    text.position.transformBy(matrix);
    text.direction = along.normal();
    text.normal = along.crossProduct(up).normal();
    text.style.setTextSize(text.style.textSize() * along.length());
}

TzGeMatrix3d const& DrawPass::transform() const {
    return transforms_.empty() ? TzGeMatrix3d::kIdentity : transforms_.back();
}

bool DrawPass::Geometry::polyline(int count,
                                  TzGePoint3d const* points,
                                  TzGeVector3d const* /*normal*/,
                                  long long /*marker*/) {
    pass_.addLines({pointsOf(count, points), false});
    return true;
}

bool DrawPass::Geometry::polygon(int count, TzGePoint3d const* points) {
    pass_.addLines({pointsOf(count, points), true});
    return true;
}

bool DrawPass::Geometry::circle(TzGePoint3d const& center,
                                double radius,
                                TzGeVector3d const& normal) {
    TzGeMatrix3d const axes = atwt(normal);
    std::vector<TzGePoint3d> points;
    for (int i = 0; i < kCircleSides; ++i) {
        double const angle = 2.0 * std::numbers::pi * i / kCircleSides;
        points.push_back(center + axes.xAxis() * (radius * std::cos(angle)) +
                         axes.yAxis() * (radius * std::sin(angle)));
    }
    pass_.addLines({std::move(points), true});
    return true;
}

bool DrawPass::Geometry::text(TzGePoint3d const& position,
                              TzGeVector3d const& normal,
                              TzGeVector3d const& direction,
                              wchar_t const* text,
                              int length,
                              bool raw,
                              TzGiTextStyle const& style) {
    TzString const whole(text);
    DrawnText drawn{
        length < 0 ? whole : whole.left(length), position, normal, direction, style, raw};
    pass_.letters_ =
        std::min(pass_.letters_ + std::min(drawn.text.length(), kMostLetters), kMostLetters + 1);
    if (pass_.hasTooManyLetters()) return true;
    pass_.place(drawn);
    pass_.list_.push_back({pass_.traits_.pen(), std::move(drawn)});
    return true;
}

bool DrawPass::Geometry::draw(TzGiDrawable* drawable) {
    if (!drawable) return true;
    pass_.nested_ = std::min(pass_.nested_ + 1, kMostNested + 1);
    pass_.drawNested(*drawable);
    return true;
}

void DrawPass::Geometry::pushModelTransform(TzGeMatrix3d const& matrix) {
    pass_.transforms_.push_back(pass_.transform() * matrix);
}

void DrawPass::Geometry::popModelTransform() {
    if (!pass_.transforms_.empty()) pass_.transforms_.pop_back();
}

}  // namespace tzhost
