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
#include <optional>
#include <string_view>

#include "host/base/result_time.h"
#include "host/display/plot_clip.h"
#include "host/display/plot_text.h"

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

Surface makeSurface(PlotFormat format, PlotSheet const& page, Output& output) {
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
    return Surface(cairo_image_surface_create(CAIRO_FORMAT_RGB24,
                                              static_cast<int>(std::lround(page.width)),
                                              static_cast<int>(std::lround(page.height))));
}

class Painter {
public:
    Painter(cairo_t* cairo, PlotSheet const& sheet, TextPainter* text)
        : cairo_(cairo), sheet_(sheet), text_(text), near_(surroundingsOf(sheet)) {}

    void clip();
    void paint(PlotShape const& shape);

private:
    // Nothing for a path that has a coordinate that is not finite.
    [[nodiscard]] std::optional<std::vector<OutlineStep>>
    placed(std::vector<OutlineStep> const& path) const;
    [[nodiscard]] bool isTooSmall(PlotShape const& letters) const;
    void paintBaseline(PlotShape const& letters);
    void setStroke(PlotShape const& shape, double before);
    void stroke(PlotShape const& shape, std::vector<OutlineStep> const& path);

    cairo_t* cairo_;
    PlotSheet const& sheet_;
    TextPainter* text_;  // null: letters are outlines
    LayoutBox near_;
};

// Lines on the edge show in their whole width, when it is the thinnest.
void Painter::clip() {
    if (!sheet_.shown) return;
    LayoutPoint const from = sheet_.place({sheet_.shown->left, sheet_.shown->top});
    LayoutPoint const to = sheet_.place({sheet_.shown->right, sheet_.shown->bottom});
    double const edge = sheet_.thinnestLine / 2.0;
    cairo_rectangle(cairo_, from.x - edge, from.y - edge, to.x - from.x + 2.0 * edge,
                    to.y - from.y + 2.0 * edge);
    cairo_clip(cairo_);
}

std::optional<std::vector<OutlineStep>>
Painter::placed(std::vector<OutlineStep> const& path) const {
    std::vector<OutlineStep> result = path;
    for (OutlineStep& step : result) {
        for (LayoutPoint& each : step.points) {
            each = sheet_.place(each);
            if (!std::isfinite(each.x) || !std::isfinite(each.y)) return std::nullopt;
        }
    }
    return result;
}

void Painter::setStroke(PlotShape const& shape, double before) {
    double const width = shape.lineWeight * sheet_.perMillimetre;
    cairo_set_line_width(cairo_, std::max(width, sheet_.thinnestLine));
    cairo_set_line_cap(cairo_, CAIRO_LINE_CAP_ROUND);
    cairo_set_line_join(cairo_, CAIRO_LINE_JOIN_ROUND);
    std::vector<double> dashes = shape.dashes;
    for (double& each : dashes)
        each *= sheet_.scale;
    double const period = std::accumulate(dashes.begin(), dashes.end(), 0.0);
    // Dashes that run into each other, or longer than anything, show as a solid line.
    bool const isVisible = period > 2.0 * sheet_.thinnestLine && std::isfinite(period);
    // An odd number of dashes goes round twice.
    cairo_set_dash(cairo_, dashes.data(), isVisible ? static_cast<int>(dashes.size()) : 0,
                   isVisible ? std::fmod(before, 2.0 * period) : 0.0);
}

void Painter::stroke(PlotShape const& shape, std::vector<OutlineStep> const& path) {
    if (!reachesBeyond(path, near_)) {
        addPath(cairo_, path);
        setStroke(shape, 0.0);
        return cairo_stroke(cairo_);
    }
    for (LinePiece const& piece : clippedLines(path, near_)) {
        addPath(cairo_, {{OutlineKind::move, {piece.from}}, {OutlineKind::line, {piece.to}}});
        setStroke(shape, piece.before);
        cairo_stroke(cairo_);
    }
}

// Cairo draws on a grid of 1/256 page unit, where such letters vanish.
bool Painter::isTooSmall(PlotShape const& letters) const {
    constexpr double kLeastLetter = 1.0 / 64.0;  // page units
    return letters.letterHeight > 0.0 && letters.letterHeight * sheet_.scale < kLeastLetter;
}

void Painter::paintBaseline(PlotShape const& letters) {
    auto const line = placed({
        {OutlineKind::move, {letters.from}},
        {OutlineKind::line, {letters.to}},
    });
    if (line) stroke(letters, *line);
}

void Painter::paint(PlotShape const& shape) {
    PlotColor const& color = shape.color;
    cairo_set_source_rgba(cairo_, color.red, color.green, color.blue, color.alpha);
    if (isTooSmall(shape)) return paintBaseline(shape);
    if (text_ && !shape.glyphs.empty()) return text_->show(shape);
    auto const path = placed(shape.path);
    if (!path) return;
    if (shape.kind == PlotKind::stroke) return stroke(shape, *path);
    addPath(cairo_, reachesBeyond(*path, near_) ? clippedArea(*path, near_) : *path);
    cairo_fill(cairo_);
}

bool paintSheet(PlotSheet const& sheet,
                PlotFormat format,
                cairo_surface_t* surface,
                std::set<std::string>& lockedFaces) {
    bool const hasPages = format == PlotFormat::pdf;
    if (hasPages) cairo_pdf_surface_set_size(surface, sheet.width, sheet.height);
    Cairo const cairo(cairo_create(surface));
    cairo_set_source_rgb(cairo.get(), 1.0, 1.0, 1.0);
    cairo_paint(cairo.get());
    TextPainter text(cairo.get(), sheet, lockedFaces);
    Painter painter(cairo.get(), sheet, hasPages ? &text : nullptr);
    painter.clip();
    sheet.scene([&](PlotShape const& shape) { painter.paint(shape); });
    if (hasPages) cairo_show_page(cairo.get());
    return cairo_status(cairo.get()) == CAIRO_STATUS_SUCCESS;
}

bool paintPages(std::vector<PlotSheet> const& sheets,
                PlotFormat format,
                ByteTaker const& take,
                std::set<std::string>& lockedFaces) {
    Output output(take);
    Surface const surface = makeSurface(format, sheets.front(), output);
    bool const good = std::all_of(sheets.begin(), sheets.end(), [&](PlotSheet const& sheet) {
        return paintSheet(sheet, format, surface.get(), lockedFaces);
    });
    if (format == PlotFormat::png) {
        (void)cairo_surface_write_to_png_stream(surface.get(), takeBytes, &output);
    }
    cairo_surface_finish(surface.get());
    return good && output.isGood() && cairo_surface_status(surface.get()) == CAIRO_STATUS_SUCCESS;
}

}  // namespace

bool paintPlot(std::vector<PlotSheet> const& sheets,
               PlotFormat format,
               ByteTaker const& take,
               std::set<std::string>& lockedFaces) {
    if (format != PlotFormat::svg) return paintPages(sheets, format, take, lockedFaces);
    std::string svg;
    ByteTaker const collect = [&](std::string_view bytes) {
        svg += bytes;
        return true;
    };
    bool const good = paintPages(sheets, format, collect, lockedFaces);
    unnumber(svg);
    return good && take(svg);
}

}  // namespace tzhost
