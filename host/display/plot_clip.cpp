#include "host/display/plot_clip.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <optional>

namespace tzhost {
namespace {

using Contour = std::vector<LayoutPoint>;

bool isWithin(LayoutPoint const& point, LayoutBox const& box) {
    return point.x >= box.left && point.x <= box.right && point.y >= box.bottom &&
           point.y <= box.top;
}

LayoutPoint between(LayoutPoint const& from, LayoutPoint const& to, double part) {
    return {from.x + (to.x - from.x) * part, from.y + (to.y - from.y) * part};
}

void addCurve(Contour& contour, std::array<LayoutPoint, 3> const& at) {
    constexpr int kSides = 32;
    LayoutPoint const start = contour.empty() ? at[0] : contour.back();
    for (int i = 1; i <= kSides; ++i) {
        double const part = static_cast<double>(i) / kSides;
        LayoutPoint const a = between(start, at[0], part);
        LayoutPoint const b = between(at[0], at[1], part);
        LayoutPoint const c = between(at[1], at[2], part);
        contour.push_back(between(between(a, b, part), between(b, c, part), part));
    }
}

std::vector<Contour> contoursOf(std::vector<OutlineStep> const& path) {
    std::vector<Contour> contours;
    for (OutlineStep const& step : path) {
        if (step.kind == OutlineKind::move || contours.empty()) contours.emplace_back();
        switch (step.kind) {
        case OutlineKind::move:
        case OutlineKind::line: contours.back().push_back(step.points[0]); break;
        case OutlineKind::curve: addCurve(contours.back(), step.points); break;
        case OutlineKind::close: break;
        }
    }
    return contours;
}

// One edge of the box: the side of it on which `sign` times the coordinate is not above `limit`
// stays.
struct Edge {
    double LayoutPoint::*coordinate;
    double sign;
    double limit;

    [[nodiscard]] double beyond(LayoutPoint const& point) const {
        return sign * (point.*coordinate) - limit;
    }
};

std::array<Edge, 4> edgesOf(LayoutBox const& box) {
    return {Edge{&LayoutPoint::x, -1.0, -box.left}, Edge{&LayoutPoint::x, 1.0, box.right},
            Edge{&LayoutPoint::y, -1.0, -box.bottom}, Edge{&LayoutPoint::y, 1.0, box.top}};
}

Contour cutAt(Edge const& edge, Contour const& contour) {
    Contour cut;
    for (std::size_t i = 0; i < contour.size(); ++i) {
        LayoutPoint const& from = contour[i];
        LayoutPoint const& to = contour[(i + 1) % contour.size()];
        double const a = edge.beyond(from);
        double const b = edge.beyond(to);
        if (a <= 0.0) cut.push_back(from);
        if ((a <= 0.0) != (b <= 0.0)) cut.push_back(between(from, to, a / (a - b)));
    }
    return cut;
}

// The part of a line within the box, from 0 to 1.
struct Part {
    double begin = 0.0;
    double end = 1.0;
};
std::optional<Part>
partWithin(LayoutPoint const& from, LayoutPoint const& to, LayoutBox const& box) {
    Part part;
    for (Edge const& edge : edgesOf(box)) {
        double const a = edge.beyond(from);
        double const b = edge.beyond(to);
        if (a > 0.0 && b > 0.0) return std::nullopt;
        if (a > 0.0) part.begin = std::max(part.begin, a / (a - b));
        if (b > 0.0) part.end = std::min(part.end, a / (a - b));
    }
    return part.begin <= part.end ? std::optional(part) : std::nullopt;
}

}  // namespace

bool reachesBeyond(std::vector<OutlineStep> const& path, LayoutBox const& box) {
    return std::any_of(path.begin(), path.end(), [&](OutlineStep const& step) {
        auto const* const first = step.points.data();
        return std::any_of(first, first + step.pointCount(),
                           [&](LayoutPoint const& point) { return !isWithin(point, box); });
    });
}

std::vector<OutlineStep> clippedArea(std::vector<OutlineStep> const& path, LayoutBox const& box) {
    std::vector<OutlineStep> steps;
    for (Contour contour : contoursOf(path)) {
        for (Edge const& edge : edgesOf(box))
            contour = cutAt(edge, contour);
        OutlineKind next = OutlineKind::move;
        for (LayoutPoint const& point : contour) {
            steps.push_back({next, {point}});
            next = OutlineKind::line;
        }
        if (!contour.empty()) steps.push_back({OutlineKind::close, {}});
    }
    return steps;
}

std::vector<LinePiece> clippedLines(std::vector<OutlineStep> const& path, LayoutBox const& box) {
    std::vector<LinePiece> pieces;
    LayoutPoint start;
    LayoutPoint here;
    double walked = 0.0;
    for (OutlineStep const& step : path) {
        if (step.kind == OutlineKind::move) {
            start = here = step.points[0];
            continue;
        }
        LayoutPoint const to = step.kind == OutlineKind::close ? start : step.points[0];
        double const length = std::hypot(to.x - here.x, to.y - here.y);
        if (auto const part = partWithin(here, to, box)) {
            pieces.push_back({between(here, to, part->begin), between(here, to, part->end),
                              walked + length * part->begin});
        }
        walked += length;
        here = to;
    }
    return pieces;
}

}  // namespace tzhost
