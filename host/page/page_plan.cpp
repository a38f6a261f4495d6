#include "host/page/page_plan.h"

#include <algorithm>
#include <cmath>

#include "host/page/page_text.h"
#include "host/text/local_text.h"

namespace tzhost {
namespace {

double scaleOf(Page const& page) {
    return page.scale->paper / page.scale->drawing * millimetresOf(page.unit);
}

SheetSize withinMargins(Page const& page) {
    SheetSize const sheet = sheetOf(page);
    return {sheet.width - 2.0 * page.margin, sheet.height - 2.0 * page.margin};
}

// The part of one axis that is shown: as long as the paper has room for, but no more than the
// window.
struct Reach {
    double low;
    double high;
};
Reach reachOf(double middle, double room, std::optional<Reach> const& window) {
    Reach reach{middle - room / 2.0, middle + room / 2.0};
    if (window) reach = {std::max(reach.low, window->low), std::min(reach.high, window->high)};
    return reach;
}

// Rounding puts the outermost points a little beyond the box that was made to hold them.
bool liesBeyond(PageBox const& box, PageBox const& within) {
    constexpr double kSlack = 1e-9;
    double const x = within.width() * kSlack;
    double const y = within.height() * kSlack;
    return box.left < within.left - x || box.right > within.right + x ||
           box.bottom < within.bottom - y || box.top > within.top + y;
}

}  // namespace

SheetSize sheetOf(Page const& page) {
    Paper const& paper = page.paper;
    bool const lies = page.landscape && paper.name != PaperName::custom;
    return lies ? SheetSize{paper.height, paper.width} : SheetSize{paper.width, paper.height};
}

PagePlan planOf(Page const& page, std::optional<PageBox> const& window, PageBox const& extents) {
    PageBox const wanted = window.value_or(extents);
    SheetSize const room = withinMargins(page);
    PagePlan plan;
    plan.middleX = wanted.left / 2.0 + wanted.right / 2.0;
    plan.middleY = wanted.bottom / 2.0 + wanted.top / 2.0;
    if (page.scale) {
        plan.scale = scaleOf(page);
    } else {
        double const fitting = std::min(room.width / wanted.width(), room.height / wanted.height());
        // A drawing that is a single point has no size to fit.
        if (std::isfinite(fitting) && fitting > 0.0) plan.scale = fitting;
    }
    std::optional<Reach> across;
    std::optional<Reach> upwards;
    if (window) {
        across = Reach{window->left, window->right};
        upwards = Reach{window->bottom, window->top};
    }
    Reach const x = reachOf(plan.middleX, room.width / plan.scale, across);
    Reach const y = reachOf(plan.middleY, room.height / plan.scale, upwards);
    plan.shown = {x.low, y.low, x.high, y.high};
    plan.leavesOut = liesBeyond(extents, plan.shown);
    return plan;
}

bool hasRoom(Page const& page) {
    SheetSize const room = withinMargins(page);
    return room.width > 0.0 && room.height > 0.0;
}

std::optional<std::string> problemOf(Page const& page) {
    if (!hasRoom(page)) return localText("the margins leave nothing of the paper");
    if (page.scale && !std::isnormal(scaleOf(page)))
        return localText("the scale is beyond all numbers");
    return std::nullopt;
}

}  // namespace tzhost
