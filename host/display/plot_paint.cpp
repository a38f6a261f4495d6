#include "host/display/plot_paint.h"

#include <cairo-pdf.h>
#include <cairo-svg.h>
#include <cairo.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <cstdlib>
#include <ctime>
#include <memory>
#include <new>
#include <numeric>
#include <string_view>

#include "host/base/result_time.h"

namespace tzhost {
namespace {

struct SurfaceFree {
    void operator()(cairo_surface_t* surface) const { cairo_surface_destroy(surface); }
};
using Surface = std::unique_ptr<cairo_surface_t, SurfaceFree>;
struct CairoFree {
    void operator()(cairo_t* cairo) const { cairo_destroy(cairo); }
};
using Cairo = std::unique_ptr<cairo_t, CairoFree>;

struct Page {
    double width;
    double height;
    double perMillimetre;  // page units
    double thinnestLine;   // page units
};
// In the order of PlotFormat: pixels of 1/96 inch, and points of 1/72 inch.
constexpr Page kPages[] = {
    {1600.0, 900.0, 96.0 / 25.4, 1.0},
    {1600.0, 900.0, 96.0 / 25.4, 1.0},
    {841.89, 595.28, 72.0 / 25.4, 0.5},
};
constexpr double kMargin = 0.05;  // of the page's smaller side

// What Cairo writes to. Nothing may be thrown through Cairo, so that a failure is kept instead.
class Output {
public:
    explicit Output(ByteTaker const& take) : take_(take) {}

    [[nodiscard]] bool isGood() const { return good_; }
    void write(std::string_view bytes) noexcept try {
        good_ = good_ && take_(bytes);
    } catch (std::bad_alloc const&) {
        good_ = false;
    }

private:
    ByteTaker const& take_;
    bool good_ = true;
};

cairo_status_t takeBytes(void* closure, unsigned char const* data, unsigned int length) {
    auto& output = *static_cast<Output*>(closure);
    output.write({reinterpret_cast<char const*>(data), length});
    return output.isGood() ? CAIRO_STATUS_SUCCESS : CAIRO_STATUS_WRITE_ERROR;
}

std::string dateText() {
    std::time_t const seconds = resultTime();
    std::tm parts{};
    char text[64] = "";
    if (gmtime_r(&seconds, &parts)) std::strftime(text, sizeof text, "%Y-%m-%dT%H:%M:%SZ", &parts);
    return text;
}

// Cairo numbers the surfaces of the process and names a picture by its number. The same drawing
// must give the same file, so the number goes.
void unnumber(std::string& svg) {
    constexpr std::string_view kName = "id=\"surface";
    std::size_t const at = svg.find(kName);
    if (at == std::string::npos) return;
    std::size_t const digits = at + kName.size();
    svg.erase(digits, svg.find('"', digits) - digits);
}

Surface makeSurface(PlotFormat format, Page const& page, Output& output) {
    switch (format) {
    case PlotFormat::svg: {
        Surface surface(
            cairo_svg_surface_create_for_stream(takeBytes, &output, page.width, page.height));
        cairo_svg_surface_set_document_unit(surface.get(), CAIRO_SVG_UNIT_PX);
        return surface;
    }
    case PlotFormat::pdf: {
        Surface surface(
            cairo_pdf_surface_create_for_stream(takeBytes, &output, page.width, page.height));
        // Left alone, Cairo takes the clock and writes it with its zone.
        if (std::getenv("SOURCE_DATE_EPOCH")) {
            cairo_pdf_surface_set_metadata(surface.get(), CAIRO_PDF_METADATA_CREATE_DATE,
                                           dateText().c_str());
        }
        return surface;
    }
    case PlotFormat::png: break;
    }
    return Surface(cairo_image_surface_create(CAIRO_FORMAT_RGB24, static_cast<int>(page.width),
                                              static_cast<int>(page.height)));
}

// From the view to the page, whose y runs downwards.
class PageMapping {
public:
    PageMapping(Page const& page, LayoutBox const& extents);

    [[nodiscard]] LayoutPoint place(LayoutPoint const& point) const {
        return {pageMiddle_.x + (point.x - middle_.x) * scale_,
                pageMiddle_.y - (point.y - middle_.y) * scale_};
    }
    [[nodiscard]] double scale() const { return scale_; }

private:
    LayoutPoint middle_;
    LayoutPoint pageMiddle_;
    double scale_ = 1.0;
};

PageMapping::PageMapping(Page const& page, LayoutBox const& extents)
    : middle_{(extents.left + extents.right) / 2.0, (extents.bottom + extents.top) / 2.0},
      pageMiddle_{page.width / 2.0, page.height / 2.0} {
    double const margin = 2.0 * kMargin * std::min(page.width, page.height);
    double const across = (page.width - margin) / extents.width();
    double const upwards = (page.height - margin) / extents.height();
    double const fitting = std::min(across, upwards);
    // A scene that is a single point has no size to fit.
    if (std::isfinite(fitting)) scale_ = fitting;
}

class Painter {
public:
    Painter(cairo_t* cairo, Page const& page, PageMapping const& mapping)
        : cairo_(cairo), page_(page), mapping_(mapping) {}

    void paint(PlotShape const& shape);

private:
    [[nodiscard]] bool addPath(std::vector<OutlineStep> const& path);
    [[nodiscard]] bool isTooSmall(PlotShape const& letters) const;
    void paintBaseline(PlotShape const& letters);
    void addStep(OutlineKind kind, std::array<LayoutPoint, 3> const& at);
    void setStroke(PlotShape const& shape);

    cairo_t* cairo_;
    Page const& page_;
    PageMapping const& mapping_;
};

void Painter::addStep(OutlineKind kind, std::array<LayoutPoint, 3> const& at) {
    switch (kind) {
    case OutlineKind::move: cairo_move_to(cairo_, at[0].x, at[0].y); break;
    case OutlineKind::line: cairo_line_to(cairo_, at[0].x, at[0].y); break;
    case OutlineKind::curve:
        cairo_curve_to(cairo_, at[0].x, at[0].y, at[1].x, at[1].y, at[2].x, at[2].y);
        break;
    case OutlineKind::close: cairo_close_path(cairo_); break;
    }
}

bool Painter::addPath(std::vector<OutlineStep> const& path) {
    cairo_new_path(cairo_);
    for (OutlineStep const& step : path) {
        std::array<LayoutPoint, 3> at;
        std::transform(step.points.begin(), step.points.end(), at.begin(),
                       [&](auto const& each) { return mapping_.place(each); });
        bool const isFinite = std::all_of(at.begin(), at.end(), [](LayoutPoint const& each) {
            return std::isfinite(each.x) && std::isfinite(each.y);
        });
        if (!isFinite) return false;
        addStep(step.kind, at);
    }
    return true;
}

void Painter::setStroke(PlotShape const& shape) {
    double const width = shape.lineWeight * page_.perMillimetre;
    cairo_set_line_width(cairo_, std::max(width, page_.thinnestLine));
    cairo_set_line_cap(cairo_, CAIRO_LINE_CAP_ROUND);
    cairo_set_line_join(cairo_, CAIRO_LINE_JOIN_ROUND);
    std::vector<double> dashes = shape.dashes;
    for (double& each : dashes)
        each *= mapping_.scale();
    double const period = std::accumulate(dashes.begin(), dashes.end(), 0.0);
    // Dashes that run into each other, or longer than anything, show as a solid line.
    bool const isVisible = period > 2.0 * page_.thinnestLine && std::isfinite(period);
    cairo_set_dash(cairo_, dashes.data(), isVisible ? static_cast<int>(dashes.size()) : 0, 0.0);
}

// Cairo draws on a grid of 1/256 page unit, where such letters vanish.
bool Painter::isTooSmall(PlotShape const& letters) const {
    constexpr double kLeastLetter = 1.0 / 64.0;  // page units
    return letters.letterHeight > 0.0 && letters.letterHeight * mapping_.scale() < kLeastLetter;
}

void Painter::paintBaseline(PlotShape const& letters) {
    std::vector<OutlineStep> const line{
        {OutlineKind::move, {letters.from}},
        {OutlineKind::line, {letters.to}},
    };
    if (!addPath(line)) return;
    setStroke(letters);
    cairo_stroke(cairo_);
}

void Painter::paint(PlotShape const& shape) {
    PlotColor const& color = shape.color;
    cairo_set_source_rgba(cairo_, color.red, color.green, color.blue, color.alpha);
    if (isTooSmall(shape)) return paintBaseline(shape);
    if (!addPath(shape.path)) return;
    if (shape.kind == PlotKind::fill) {
        cairo_fill(cairo_);
        return;
    }
    setStroke(shape);
    cairo_stroke(cairo_);
}

bool paintPage(PlotScene const& scene, PlotFormat format, ByteTaker const& take) {
    Page const& page = kPages[static_cast<std::size_t>(format)];
    PageMapping const mapping(page, extentsOf(scene).value_or(LayoutBox{}));
    Output output(take);
    Surface const surface = makeSurface(format, page, output);
    Cairo cairo(cairo_create(surface.get()));
    cairo_set_source_rgb(cairo.get(), 1.0, 1.0, 1.0);
    cairo_paint(cairo.get());
    Painter painter(cairo.get(), page, mapping);
    scene([&](PlotShape const& shape) { painter.paint(shape); });
    bool const good = cairo_status(cairo.get()) == CAIRO_STATUS_SUCCESS;
    cairo.reset();
    if (format == PlotFormat::png) {
        (void)cairo_surface_write_to_png_stream(surface.get(), takeBytes, &output);
    }
    cairo_surface_finish(surface.get());
    return good && output.isGood() && cairo_surface_status(surface.get()) == CAIRO_STATUS_SUCCESS;
}

}  // namespace

bool paintPlot(PlotScene const& scene, PlotFormat format, ByteTaker const& take) {
    if (format != PlotFormat::svg) return paintPage(scene, format, take);
    std::string svg;
    bool const good = paintPage(scene, format, [&](std::string_view bytes) {
        svg += bytes;
        return true;
    });
    unnumber(svg);
    return good && take(svg);
}

}  // namespace tzhost
