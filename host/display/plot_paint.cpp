#include "host/display/plot_paint.h"

#include <cairo-pdf.h>
#include <cairo.h>

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <ctime>
#include <memory>
#include <new>
#include <string_view>

#include "host/base/result_time.h"
#include "host/display/plot_clip.h"
#include "host/display/plot_text.h"
#include "host/display/svg_writer.h"

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

Surface makeSurface(PlotFormat format, PlotSheet const& page, Output& output) {
    if (format == PlotFormat::pdf) {
        Surface surface(
            cairo_pdf_surface_create_for_stream(takeBytes, &output, page.width, page.height));
        // Left alone, Cairo takes the clock and writes it with its zone.
        if (std::getenv("SOURCE_DATE_EPOCH")) {
            cairo_pdf_surface_set_metadata(surface.get(), CAIRO_PDF_METADATA_CREATE_DATE,
                                           dateText().c_str());
        }
        return surface;
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
    void setStroke(PlotShape const& shape, double before);
    void stroke(PlotShape const& shape, std::vector<OutlineStep> const& path);

    cairo_t* cairo_;
    PlotSheet const& sheet_;
    TextPainter* text_;  // null: letters are outlines
    LayoutBox near_;
};

void Painter::clip() {
    auto const box = sheet_.clip();
    if (!box) return;
    cairo_rectangle(cairo_, box->left, box->bottom, box->width(), box->height());
    cairo_clip(cairo_);
}

void Painter::setStroke(PlotShape const& shape, double before) {
    StrokeLook const look = strokeOf(sheet_, shape);
    cairo_set_line_width(cairo_, look.width);
    cairo_set_line_cap(cairo_, CAIRO_LINE_CAP_ROUND);
    cairo_set_line_join(cairo_, CAIRO_LINE_JOIN_ROUND);
    cairo_set_dash(cairo_, look.dashes.data(), static_cast<int>(look.dashes.size()),
                   look.offsetAfter(before));
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

void Painter::paint(PlotShape const& shape) {
    PlotColor const& color = shape.color;
    cairo_set_source_rgba(cairo_, color.red, color.green, color.blue, color.alpha);
    bool const isBaseline = isTooSmall(sheet_, shape);
    if (text_ && isText(sheet_, shape)) return text_->show(shape);
    auto const path = placedPath(sheet_, isBaseline ? baselineOf(shape) : shape.path);
    if (!path) return;
    if (shape.kind == PlotKind::stroke || isBaseline) return stroke(shape, *path);
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
    if (format == PlotFormat::svg) return SvgWriter(sheets.front(), take).write();
    return paintPages(sheets, format, take, lockedFaces);
}

}  // namespace tzhost
