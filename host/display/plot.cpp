#include "host/display/plot.h"

#include <algorithm>
#include <array>
#include <new>
#include <set>
#include <string_view>

#include "host/base/fault_point.h"
#include "host/base/job.h"
#include "host/database/drawing.h"
#include "host/display/draw_pass.h"
#include "host/display/plot_paint.h"
#include "host/display/record_access.h"
#include "host/files/file_bytes.h"
#include "host/files/safe_file.h"
#include "host/files/standard_streams.h"
#include "host/page/page_plan.h"
#include "host/page/page_text.h"
#include "host/text/local_text.h"

namespace tzhost {
namespace {

constexpr std::string_view kStandardOutput = "-";
constexpr double kDotsPerInch = 300.0;
constexpr double kMostDots = 30'000.0;  // on a side of a picture

struct SpaceToPlot {
    Space space = Space::model;
    TzArray<TzDbObjectId> entities;
};

SpaceToPlot contentsOf(Drawing const& drawing, Space space) {
    SpaceToPlot result;
    result.space = space;
    TzDbObjectId const id = space == Space::paper ? drawing.paperSpace() : drawing.modelSpace();
    if (auto const* const record = objectOf<TzDbBlockTableRecord>(id))
        record->entities(result.entities);
    return result;
}

std::vector<SpaceToPlot> spacesOf(Drawing const& drawing, PlotSpace wanted) {
    switch (wanted) {
    case PlotSpace::active: return {contentsOf(drawing, activeSpace())};
    case PlotSpace::model: return {contentsOf(drawing, Space::model)};
    case PlotSpace::paper: return {contentsOf(drawing, Space::paper)};
    case PlotSpace::all: break;
    }
    return {contentsOf(drawing, Space::model), contentsOf(drawing, Space::paper)};
}

// Of pages with nothing on them no more than one stays, and only when all are such.
void dropEmpty(std::vector<PlotSheet>& sheets) {
    auto const isEmpty = [](PlotSheet const& sheet) { return !extentsOf(sheet.scene); };
    if (std::all_of(sheets.begin(), sheets.end(), isEmpty))
        sheets.resize(1);
    else
        std::erase_if(sheets, isEmpty);
}

// The window lies on the world's XY plane; the box around it is what the view shows of it.
std::optional<PageBox> windowIn(ViewAxes const& axes, std::optional<PageBox> const& window) {
    if (!window) return std::nullopt;
    std::array const corners{axes.project(TzGePoint3d(window->left, window->bottom, 0.0)),
                             axes.project(TzGePoint3d(window->right, window->bottom, 0.0)),
                             axes.project(TzGePoint3d(window->left, window->top, 0.0)),
                             axes.project(TzGePoint3d(window->right, window->top, 0.0))};
    auto const [left, right] = std::minmax_element(
        corners.begin(), corners.end(), [](auto const& a, auto const& b) { return a.x < b.x; });
    auto const [bottom, top] = std::minmax_element(
        corners.begin(), corners.end(), [](auto const& a, auto const& b) { return a.y < b.y; });
    return PageBox{left->x, bottom->y, right->x, top->y};
}

class Plot {
public:
    Plot(Drawing& drawing, PlotOrder const& order)
        : drawing_(drawing), order_(order), page_(pageOf(drawing.settings().page, order.page)) {}

    // Whether the pages are there; if not, the report says why.
    [[nodiscard]] bool make();
    [[nodiscard]] bool write();
    [[nodiscard]] PlotReport takeReport() { return std::move(report_); }

private:
    [[nodiscard]] std::string name() const {
        return order_.file == kStandardOutput ? localText("standard output") : order_.file;
    }
    bool fail(std::string const& why) {
        report_.problem = name() + ": " + why;
        return false;
    }
    [[nodiscard]] bool paint(ByteTaker const& take);
    [[nodiscard]] bool writeOutput();
    [[nodiscard]] bool writeFile();
    [[nodiscard]] bool checkPage();
    [[nodiscard]] bool addSheet(SpaceToPlot const& space);
    [[nodiscard]] bool addPaper(PlotScene scene, ViewAxes const& axes);
    void noteLeftOut(bool hasWindow);
    void noteLocked(std::set<std::string> const& faces);

    Drawing& drawing_;
    PlotOrder const& order_;
    std::optional<Page> page_;
    std::vector<PlotSheet> sheets_;
    PlotReport report_;
};

bool Plot::checkPage() {
    if (order_.space == PlotSpace::all && order_.format != PlotFormat::pdf)
        return fail(localText("only a PDF has a page for each space"));
    if (!page_) return true;
    if (auto const problem = problemOf(*page_)) return fail(*problem);
    SheetSize const sheet = sheetOf(*page_);
    double const dots = std::max(sheet.width, sheet.height) / millimetresOf(PageUnit::inch) *
                        order_.page.dotsPerInch.value_or(kDotsPerInch);
    bool const isPicture = order_.format == PlotFormat::png;
    if (isPicture && dots > kMostDots)
        return fail(localText("the picture would have more than 30,000 pixels on a side"));
    return true;
}

void Plot::noteLeftOut(bool hasWindow) {
    char const* const what = hasWindow ? forLocalText("what lies outside the window is left out")
                                       : forLocalText("what lies outside the page is left out");
    std::string const remark = name() + ": " + localText(what);
    auto& remarks = report_.remarks;
    if (std::find(remarks.begin(), remarks.end(), remark) == remarks.end())
        remarks.push_back(remark);
}

bool Plot::addPaper(PlotScene scene, ViewAxes const& axes) {
    std::optional<PageBox> const window = windowIn(axes, page_->window);
    if (window && !makeWindow(window->left, window->bottom, window->right, window->top))
        return fail(localText("the window is seen from its edge and has no size"));
    sheets_.push_back(paperSheet(std::move(scene), order_.format, *page_, window,
                                 order_.page.dotsPerInch.value_or(kDotsPerInch)));
    if (sheets_.back().shown) noteLeftOut(window.has_value());
    return true;
}

bool Plot::addSheet(SpaceToPlot const& space) {
    DrawPass pass(&drawing_, DrawPass::Entities::strokes);
    for (TzDbObjectId const& id : space.entities) {
        Job::step();
        pass.draw(objectOf<TzDbEntity>(id));
    }
    if (pass.hasTooManyLetters()) return fail(localText("it has more letters than a plot takes"));
    if (!pass.isWhole()) return fail(localText("its blocks stand for too much to plot"));
    ViewAxes const axes = viewAxes(space.space);
    DrawList list = pass.takeList();
    report_.isEmpty = report_.isEmpty && list.empty();
    PlotScene scene = makeScene(std::move(list), axes);
    if (page_) return addPaper(std::move(scene), axes);
    sheets_.push_back(fittedSheet(std::move(scene), order_.format));
    return true;
}

bool Plot::make() {
    if (faultAt("plotDrawing")) return fail(localText("cannot be plotted"));
    if (!checkPage()) return false;
    std::vector<SpaceToPlot> const spaces = spacesOf(drawing_, order_.space);
    bool const isMade = std::all_of(spaces.begin(), spaces.end(),
                                    [&](SpaceToPlot const& each) { return addSheet(each); });
    if (isMade && spaces.size() > 1) dropEmpty(sheets_);
    return isMade;
}

// Each face that had to be left out of the document, with what became of its letters.
void Plot::noteLocked(std::set<std::string> const& faces) {
    for (std::string const& face : faces) {
        report_.remarks.push_back(name() + ": " + face + ": " +
                                  localText("may not be embedded, its letters are outlines"));
    }
}

bool Plot::paint(ByteTaker const& take) {
    std::set<std::string> lockedFaces;
    bool const painted = paintPlot(sheets_, order_.format, take, lockedFaces);
    noteLocked(lockedFaces);
    return painted;
}

bool Plot::write() {
    return order_.file == kStandardOutput ? writeOutput() : writeFile();
}

bool Plot::writeOutput() {
    std::string reason;
    bool const painted = paint([&](std::string_view bytes) {
        if (reason.empty() && !writeStandardOutput(bytes)) reason = systemReason();
        return reason.empty();
    });
    if (!reason.empty()) return fail(localText("cannot be written") + ": " + reason);
    return painted || fail(localText("the picture could not be made"));
}

bool Plot::writeFile() {
    SafeFile target(order_.file, order_.ifReadOnly);
    bool written = target.isOpen();
    bool const painted = written && paint([&](std::string_view bytes) {
                             written = written && target.write(bytes);
                             return written;
                         });
    if (written && !painted) return fail(localText("the picture could not be made"));
    if (written && target.commit()) return true;
    return fail(localText("cannot be written") + ": " + target.reason());
}

}  // namespace

PlotReport plotDrawing(TzDbDatabase& database, PlotOrder const& order) try {
    Job const job(localText(L"Plotting"));
    Plot plot(*drawingOf(&database), order);
    // Remarks tell what a plot leaves out, so a plot that failed has none.
    if (!plot.make() || !plot.write()) return {plot.takeReport().problem, {}, true};
    return plot.takeReport();
} catch (std::bad_alloc const&) {
    return {order.file + ": " + localText("cannot be written") + ": " +
                localText("memory ran short"),
            {},
            true};
}

}  // namespace tzhost
