#include "host/layout/text_outline.h"

#include <pango/pangocairo.h>

#include <cmath>
#include <cstddef>
#include <memory>

#include "host/layout/shape_engine.h"

namespace tzhost {
namespace {

struct CairoFree {
    void operator()(cairo_t* cairo) const { cairo_destroy(cairo); }
};
using Cairo = std::unique_ptr<cairo_t, CairoFree>;

struct PathFree {
    void operator()(cairo_path_t* path) const { cairo_path_destroy(path); }
};
using Path = std::unique_ptr<cairo_path_t, PathFree>;

// A canvas that only collects paths, one pixel being a thousandth of the reference size.
Cairo makeCanvas() {
    cairo_surface_t* const surface = cairo_recording_surface_create(CAIRO_CONTENT_ALPHA, nullptr);
    Cairo canvas{cairo_create(surface)};
    cairo_surface_destroy(surface);
    return canvas;
}

// Whether a move opens no outline: one that the canvas left at the start or the end of a letter.
bool leadsNowhere(cairo_path_t const& path, int index) {
    int const next = index + path.data[index].header.length;
    return path.data[index].header.type == CAIRO_PATH_MOVE_TO &&
           (next >= path.num_data || path.data[next].header.type == CAIRO_PATH_MOVE_TO);
}

class Outliner {
public:
    explicit Outliner(GlyphRun const& run)
        : run_(run), face_(ShapeEngine::instance().face(run.face)),
          scale_(run.height / face_.capHeight), slant_(std::tan(run.oblique)) {}

    std::vector<OutlineStep> outline();

private:
    void addItem(PangoItem const& item, Utf8Text const& utf8, PangoGlyphString& glyphs);
    void addGlyph(PangoFont* font, PangoGlyphInfo const& glyph);
    void addPath(cairo_path_t const& path);
    [[nodiscard]] LayoutPoint place(cairo_path_data_t const& data) const;

    GlyphRun const& run_;
    EngineFace const& face_;
    double scale_;  // drawing units in a Pango unit
    double slant_;
    double pen_ = 0.0;  // along the baseline, from the run's start
    Cairo canvas_ = makeCanvas();
    std::vector<OutlineStep> steps_;
};

std::vector<OutlineStep> Outliner::outline() {
    PangoContext* const context = ShapeEngine::instance().context();
    Utf8Text const utf8 = utf8Of(run_.text);
    int const size = static_cast<int>(utf8.bytes.size());
    PangoAttrList* const attributes = pango_attr_list_new();
    pango_attr_list_insert(attributes, pango_attr_font_desc_new(face_.description));
    PangoDirection const direction = run_.rightToLeft ? PANGO_DIRECTION_RTL : PANGO_DIRECTION_LTR;
    GList* items = pango_itemize_with_base_dir(context, direction, utf8.bytes.c_str(), 0, size,
                                               attributes, nullptr);
    items = pango_reorder_items(items);
    PangoGlyphString* const glyphs = pango_glyph_string_new();
    for (GList* node = items; node != nullptr; node = node->next) {
        auto* const item = static_cast<PangoItem*>(node->data);
        addItem(*item, utf8, *glyphs);
        pango_item_free(item);
    }
    pango_glyph_string_free(glyphs);
    g_list_free(items);
    pango_attr_list_unref(attributes);
    return std::move(steps_);
}

void Outliner::addItem(PangoItem const& item, Utf8Text const& utf8, PangoGlyphString& glyphs) {
    pango_shape_full(utf8.bytes.c_str() + item.offset, item.length, utf8.bytes.c_str(),
                     static_cast<int>(utf8.bytes.size()), &item.analysis, &glyphs);
    for (int i = 0; i < glyphs.num_glyphs; ++i) {
        addGlyph(item.analysis.font, glyphs.glyphs[i]);
    }
}

void Outliner::addGlyph(PangoFont* font, PangoGlyphInfo const& glyph) {
    PangoGlyphInfo one = glyph;
    int cluster = 0;
    PangoGlyphString single{1, &one, &cluster, 0};
    cairo_new_path(canvas_.get());
    cairo_move_to(canvas_.get(), 0.0, 0.0);
    pango_cairo_glyph_string_path(canvas_.get(), font, &single);
    Path const path{cairo_copy_path(canvas_.get())};
    addPath(*path);
    pen_ += glyph.geometry.width * scale_ * run_.widthFactor * run_.tracking;
}

void Outliner::addPath(cairo_path_t const& path) {
    for (int i = 0; i < path.num_data; i += path.data[i].header.length) {
        cairo_path_data_t const* const data = path.data + i;
        if (leadsNowhere(path, i)) {
            continue;
        }
        switch (data->header.type) {
        case CAIRO_PATH_MOVE_TO: steps_.push_back({OutlineKind::move, {place(data[1])}}); break;
        case CAIRO_PATH_LINE_TO: steps_.push_back({OutlineKind::line, {place(data[1])}}); break;
        case CAIRO_PATH_CURVE_TO:
            steps_.push_back({
                OutlineKind::curve, {place(data[1]), place(data[2]), place(data[3])}
            });
            break;
        case CAIRO_PATH_CLOSE_PATH: steps_.push_back({OutlineKind::close, {}}); break;
        }
    }
}

LayoutPoint Outliner::place(cairo_path_data_t const& data) const {
    double const y = -data.point.y * PANGO_SCALE * scale_;
    double const x = pen_ + data.point.x * PANGO_SCALE * scale_ * run_.widthFactor + y * slant_;
    return {run_.x + (run_.mirroredX ? -x : x), run_.y + (run_.mirroredY ? -y : y)};
}

}  // namespace

std::vector<OutlineStep> textOutline(GlyphRun const& run) {
    return Outliner(run).outline();
}

}  // namespace tzhost
