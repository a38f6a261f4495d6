#include "host/display/plot_sheet.h"

#include <algorithm>
#include <cmath>
#include <numeric>
#include <utility>

#include "host/page/page_plan.h"

namespace tzhost {
namespace {

constexpr double kInch = 25.4;          // millimetres
constexpr double kSvgUnits = 96.0;      // in an inch
constexpr double kPdfUnits = 72.0;      // in an inch
constexpr double kFittedMargin = 0.05;  // of the page's smaller side

PlotSheet emptySheet(PlotFormat format) {
    PlotSheet sheet;
    bool const isPdf = format == PlotFormat::pdf;
    sheet.width = isPdf ? 841.89 : 1600.0;
    sheet.height = isPdf ? 595.28 : 900.0;
    sheet.perMillimetre = (isPdf ? kPdfUnits : kSvgUnits) / kInch;
    sheet.thinnestLine = isPdf ? 0.5 : 1.0;
    return sheet;
}

double unitsInInch(PlotFormat format, double dotsPerInch) {
    switch (format) {
    case PlotFormat::svg: return kSvgUnits;
    case PlotFormat::pdf: return kPdfUnits;
    case PlotFormat::png: break;
    }
    return dotsPerInch;
}

}  // namespace

std::optional<LayoutBox> PlotSheet::clip() const {
    if (!shown) return std::nullopt;
    LayoutPoint const from = place({shown->left, shown->top});
    LayoutPoint const to = place({shown->right, shown->bottom});
    double const edge = thinnestLine / 2.0;
    return LayoutBox{from.x - edge, from.y - edge, to.x + edge, to.y + edge};
}

std::optional<std::vector<OutlineStep>> placedPath(PlotSheet const& sheet,
                                                   std::vector<OutlineStep> const& path) {
    std::vector<OutlineStep> result = path;
    for (OutlineStep& step : result) {
        for (LayoutPoint& each : step.points) {
            each = sheet.place(each);
            if (!std::isfinite(each.x) || !std::isfinite(each.y)) return std::nullopt;
        }
    }
    return result;
}

// Cairo draws on a grid of 1/256 page unit, where such letters vanish.
bool isTooSmall(PlotSheet const& sheet, PlotShape const& shape) {
    constexpr double kLeastLetter = 1.0 / 64.0;  // page units
    return shape.letterHeight > 0.0 && shape.letterHeight * sheet.scale < kLeastLetter;
}

// Viewers count in numbers of limited size too, and show nothing of fonts of some metres.
bool isText(PlotSheet const& sheet, PlotShape const& shape) {
    bool const isOnPage = shape.letterHeight * sheet.scale <= std::max(sheet.width, sheet.height);
    return !shape.glyphs.empty() && isOnPage && !isTooSmall(sheet, shape);
}

std::vector<OutlineStep> baselineOf(PlotShape const& letters) {
    return {{OutlineKind::move, {letters.from}}, {OutlineKind::line, {letters.to}}};
}

// An odd number of dashes goes round twice.
double StrokeLook::offsetAfter(double before) const {
    double const period = std::accumulate(dashes.begin(), dashes.end(), 0.0);
    return dashes.empty() ? 0.0 : std::fmod(before, 2.0 * period);
}

StrokeLook strokeOf(PlotSheet const& sheet, PlotShape const& shape) {
    StrokeLook look;
    look.width = std::max(shape.lineWeight * sheet.perMillimetre, sheet.thinnestLine);
    for (double const each : shape.dashes)
        look.dashes.push_back(each * sheet.scale);
    double const period = std::accumulate(look.dashes.begin(), look.dashes.end(), 0.0);
    bool const isVisible = period > 2.0 * sheet.thinnestLine && std::isfinite(period);
    if (!isVisible) look.dashes.clear();
    return look;
}

PlotSheet fittedSheet(PlotScene scene, PlotFormat format) {
    PlotSheet sheet = emptySheet(format);
    sheet.scene = std::move(scene);
    LayoutBox const extents = extentsOf(sheet.scene).value_or(LayoutBox{});
    sheet.middle = {(extents.left + extents.right) / 2.0, (extents.bottom + extents.top) / 2.0};
    double const margin = 2.0 * kFittedMargin * std::min(sheet.width, sheet.height);
    double const across = (sheet.width - margin) / extents.width();
    double const upwards = (sheet.height - margin) / extents.height();
    double const fitting = std::min(across, upwards);
    // A scene that is a single point has no size to fit.
    if (std::isfinite(fitting)) sheet.scale = fitting;
    return sheet;
}

PlotSheet paperSheet(PlotScene scene,
                     PlotFormat format,
                     Page const& page,
                     std::optional<PageBox> const& window,
                     double dotsPerInch) {
    constexpr double kThinnest = 0.18;  // millimetres: half a point
    PlotSheet sheet;
    sheet.scene = std::move(scene);
    LayoutBox const extents = extentsOf(sheet.scene).value_or(LayoutBox{});
    PagePlan const plan =
        planOf(page, window, {extents.left, extents.bottom, extents.right, extents.top});
    sheet.perMillimetre = unitsInInch(format, dotsPerInch) / kInch;
    sheet.width = sheetOf(page).width * sheet.perMillimetre;
    sheet.height = sheetOf(page).height * sheet.perMillimetre;
    sheet.thinnestLine = kThinnest * sheet.perMillimetre;
    if (format == PlotFormat::png) sheet.thinnestLine = std::max(sheet.thinnestLine, 1.0);
    sheet.isPaper = true;
    sheet.middle = {plan.middleX, plan.middleY};
    sheet.scale = plan.scale * sheet.perMillimetre;
    if (plan.leavesOut)
        sheet.shown = {plan.shown.left, plan.shown.bottom, plan.shown.right, plan.shown.top};
    return sheet;
}

}  // namespace tzhost
