#include "host/display/plot_glyphs.h"

#include <pango/pango.h>

#include <algorithm>
#include <map>
#include <string_view>
#include <utility>

namespace tzhost {
namespace {

bool isSame(LayoutPoint const& a, LayoutPoint const& b) {
    return a.x == b.x && a.y == b.y;
}

bool areAlike(PlotGlyph const& a, PlotGlyph const& b) {
    return a.font == b.font && a.rightToLeft == b.rightToLeft && isSame(a.along, b.along) &&
           isSame(a.down, b.down);
}

// The points of a glyph's outline in the view; the place of one that has none.
std::vector<LayoutPoint> pointsOf(PlotGlyph const& glyph) {
    std::vector<LayoutPoint> points;
    auto const add = [&](LayoutPoint const& point) {
        points.push_back({glyph.origin.x + glyph.along.x * point.x + glyph.down.x * point.y,
                          glyph.origin.y + glyph.along.y * point.x + glyph.down.y * point.y});
    };
    if (glyph.font && glyph.glyph != PANGO_GLYPH_EMPTY) {
        for (OutlineStep const& step : outlineOf(glyph.font, glyph.glyph)) {
            if (step.kind == OutlineKind::close) continue;
            std::size_t const count = step.kind == OutlineKind::curve ? step.points.size() : 1;
            for (std::size_t i = 0; i < count; ++i)
                add(step.points[i]);
        }
    }
    if (points.empty()) add({});
    return points;
}

// Whether a part of the glyph lies within what the page shows.
bool isShown(PlotGlyph const& glyph, PlotSheet const& sheet) {
    if (!sheet.shown) return true;
    LayoutBox const& shown = *sheet.shown;
    std::vector<LayoutPoint> const points = pointsOf(glyph);
    auto const allAre = [&](auto beyond) {
        return std::all_of(points.begin(), points.end(), beyond);
    };
    return !allAre([&](LayoutPoint const& each) { return each.x < shown.left; }) &&
           !allAre([&](LayoutPoint const& each) { return each.x > shown.right; }) &&
           !allAre([&](LayoutPoint const& each) { return each.y < shown.bottom; }) &&
           !allAre([&](LayoutPoint const& each) { return each.y > shown.top; });
}

}  // namespace

std::string wordsOf(PlotShape const& letters, PlotSheet const& sheet) {
    std::map<std::size_t, std::string_view> parts;
    for (PlotGlyph const& each : letters.glyphs) {
        if (!each.text.empty() && isShown(each, sheet)) parts.emplace(each.at, each.text);
    }
    std::string words;
    for (auto const& [at, part] : parts)
        words += part;
    return words;
}

void eachAlike(PlotShape const& letters,
               PlotSheet const& sheet,
               std::function<bool(PlotGlyph const&)> const& separates,
               std::function<void(AlikeGlyphs const&)> const& take) {
    AlikeGlyphs alike;
    bool isApart = false;
    for (PlotGlyph const& each : letters.glyphs) {
        if (!isShown(each, sheet)) continue;
        bool const isNext = separates(each);
        if (!alike.empty() && (!areAlike(alike.back(), each) || isNext != isApart))
            take(std::exchange(alike, {}));
        isApart = isNext;
        alike.push_back(each);
    }
    if (!alike.empty()) take(alike);
}

}  // namespace tzhost
