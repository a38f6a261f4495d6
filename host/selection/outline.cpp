#include "host/selection/outline.h"

#include <algorithm>
#include <utility>

#include "host/base/job.h"
#include "host/database/geometry.h"
#include "host/database/user_system.h"
#include "host/display/draw_pass.h"
#include "host/display/shown.h"
#include "tz/db/mtext.h"

namespace tzhost {

namespace {

using Corners = std::vector<TzGePoint3d>;

Corners boxOf(TzGePoint3d const& corner, TzGeVector3d const& along, TzGeVector3d const& up) {
    return {corner, corner + along, corner + along + up, corner + up, corner};
}

Corners boxOf(DrawnText const& drawn) {
    TzGePoint2d const size = drawn.style.extents(drawn.text, true, -1, drawn.raw);
    // Backward and upside-down texts are turned over about their position.
    double const x = drawn.style.isBackward() ? -size.x : size.x;
    double const y = drawn.style.isUpsideDown() ? -size.y : size.y;
    TzGeVector3d const along = drawn.direction.normal() * x;
    TzGeVector3d const up = drawn.normal.crossProduct(drawn.direction).normal() * y;
    // A vertical text runs down from its position, about its middle.
    if (drawn.style.isVertical()) return boxOf(drawn.position - along * 0.5 - up, along, up);
    return boxOf(drawn.position, along, up);
}

Corners boxOf(TzDbMText const& text) {
    TzArray<TzGePoint3d> points;
    text.getBoundingPoints(points);
    if (points.length() < 4) return {};
    return {points[0], points[1], points[3], points[2], points[0]};
}

// Whether a and b, and with them all between, lie beyond one side of the box.
bool isBeyondOneSide(TzGePoint2d const& a, TzGePoint2d const& b, FlatBox const& box) {
    return std::max(a.x, b.x) < box.low.x || std::min(a.x, b.x) > box.high.x ||
           std::max(a.y, b.y) < box.low.y || std::min(a.y, b.y) > box.high.y;
}

// Above 0 when p lies to the left of the line from a to b.
double sideOf(TzGePoint2d const& a, TzGePoint2d const& b, TzGePoint2d const& p) {
    return (b.x - a.x) * (p.y - a.y) - (b.y - a.y) * (p.x - a.x);
}

bool segmentTouches(TzGePoint2d const& a, TzGePoint2d const& b, FlatBox const& box) {
    if (isBeyondOneSide(a, b, box)) return false;
    double const sides[] = {
        sideOf(a, b, box.low),
        sideOf(a, b, {box.high.x, box.low.y}),
        sideOf(a, b, box.high),
        sideOf(a, b, {box.low.x, box.high.y}),
    };
    auto const [least, most] = std::minmax_element(std::begin(sides), std::end(sides));
    return *least <= 0 && *most >= 0;
}

// Whether c and d lie on both sides of the line through a and b, or on it.
bool liesBetween(TzGePoint2d const& a,
                 TzGePoint2d const& b,
                 TzGePoint2d const& c,
                 TzGePoint2d const& d) {
    auto const [least, most] = std::minmax({sideOf(a, b, c), sideOf(a, b, d)});
    return least <= 0 && most >= 0;
}

bool segmentsMeet(TzGePoint2d const& a,
                  TzGePoint2d const& b,
                  TzGePoint2d const& c,
                  TzGePoint2d const& d) {
    return !isBeyondOneSide(a, b, FlatBox::between(c, d)) && liesBetween(a, b, c, d) &&
           liesBetween(c, d, a, b);
}

bool linesMeet(std::vector<TzGePoint2d> const& one, std::vector<TzGePoint2d> const& other) {
    std::size_t const last = one.size() - 1;
    for (std::size_t i = 0; i <= last; ++i) {
        TzGePoint2d const& to = one[std::min(i + 1, last)];  // a point alone is a short line
        for (std::size_t k = 1; k < other.size(); ++k) {
            if (segmentsMeet(one[i], to, other[k - 1], other[k])) return true;
        }
    }
    return false;
}

// By the number of edges to the right of the point.
bool areaHolds(std::vector<TzGePoint2d> const& area, TzGePoint2d const& point) {
    bool isInside = false;
    for (std::size_t i = 1; i < area.size(); ++i) {
        TzGePoint2d const& a = area[i - 1];
        TzGePoint2d const& b = area[i];
        if ((a.y > point.y) == (b.y > point.y)) continue;
        double const x = a.x + (point.y - a.y) / (b.y - a.y) * (b.x - a.x);
        if (point.x < x) isInside = !isInside;
    }
    return isInside;
}

}  // namespace

FlatBox FlatBox::between(TzGePoint2d const& a, TzGePoint2d const& b) {
    return {{std::min(a.x, b.x), std::min(a.y, b.y)}, {std::max(a.x, b.x), std::max(a.y, b.y)}};
}

bool FlatBox::holds(TzGePoint2d const& point) const {
    return point.x >= low.x && point.x <= high.x && point.y >= low.y && point.y <= high.y;
}

Outline Outline::of(TzDbEntity& entity, TzGeMatrix3d const& placed) {
    Job::step();
    Outline outline;
    if (!isShown(entity)) return outline;
    TzGeMatrix3d const toUser = currentUserSystem().matrix().inverse() * placed;
    auto const add = [&](Corners const& corners, Inside inside) {
        Path path;
        path.inside = inside;
        for (TzGePoint3d const& each : corners) {
            TzGePoint3d const user = toUser * each;
            if (!isFinite(user)) return;
            path.points.push_back(user.convert2d());
        }
        if (!path.points.empty()) outline.paths_.push_back(std::move(path));
    };
    if (auto const* const text = dynamic_cast<TzDbMText const*>(&entity)) {
        add(boxOf(*text), Inside::belongs);
        return outline;
    }
    DrawPass pass(entity.database(), DrawPass::Entities::strokes);
    pass.draw(&entity);
    for (DrawOp const& op : pass.list()) {
        if (auto const* const text = std::get_if<DrawnText>(&op.what))
            add(boxOf(*text), Inside::belongs);
        auto const* const lines = std::get_if<DrawnLines>(&op.what);
        if (lines == nullptr) continue;
        Corners points = lines->points;
        if (lines->closed) points.push_back(lines->points.front());
        add(points, Inside::empty);
    }
    return outline;
}

std::optional<FlatBox> Outline::box() const {
    if (paths_.empty()) return std::nullopt;
    TzGePoint2d const first = paths_.front().points.front();
    FlatBox box{first, first};
    for (Path const& path : paths_) {
        for (TzGePoint2d const& each : path.points) {
            box.low = {std::min(box.low.x, each.x), std::min(box.low.y, each.y)};
            box.high = {std::max(box.high.x, each.x), std::max(box.high.y, each.y)};
        }
    }
    return box;
}

bool Outline::boxHolds(TzGePoint2d const& point) const {
    auto const around = box();
    return around && around->holds(point);
}

bool Outline::isWithin(FlatBox const& box) const {
    for (Path const& path : paths_) {
        for (TzGePoint2d const& each : path.points) {
            if (!box.holds(each)) return false;
        }
    }
    return !paths_.empty();
}

bool Outline::touches(FlatBox const& box) const {
    for (Path const& path : paths_) {
        if (path.inside == Inside::belongs && areaHolds(path.points, box.low)) return true;
        if (path.points.size() == 1 && box.holds(path.points.front())) return true;
        for (std::size_t i = 1; i < path.points.size(); ++i) {
            if (segmentTouches(path.points[i - 1], path.points[i], box)) return true;
        }
    }
    return false;
}

bool Outline::meets(std::vector<TzGePoint2d> const& line) const {
    return std::any_of(paths_.begin(), paths_.end(), [&](Path const& path) {
        bool const isInside =
            path.inside == Inside::belongs && areaHolds(path.points, line.front());
        return isInside || linesMeet(path.points, line);
    });
}

}  // namespace tzhost
