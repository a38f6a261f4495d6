#include "host/shaping/glyph_shapes.h"

#include <pango/pangocairo.h>

#include <cstddef>
#include <map>
#include <memory>
#include <utility>

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

LayoutPoint pointOf(cairo_path_data_t const& data) {
    return {data.point.x * PANGO_SCALE, data.point.y * PANGO_SCALE};
}

std::vector<OutlineStep> stepsOf(cairo_path_t const& path) {
    std::vector<OutlineStep> steps;
    for (int i = 0; i < path.num_data; i += path.data[i].header.length) {
        cairo_path_data_t const* const data = path.data + i;
        if (leadsNowhere(path, i)) {
            continue;
        }
        switch (data->header.type) {
        case CAIRO_PATH_MOVE_TO: steps.push_back({OutlineKind::move, {pointOf(data[1])}}); break;
        case CAIRO_PATH_LINE_TO: steps.push_back({OutlineKind::line, {pointOf(data[1])}}); break;
        case CAIRO_PATH_CURVE_TO:
            steps.push_back(
                {OutlineKind::curve, {pointOf(data[1]), pointOf(data[2]), pointOf(data[3])}});
            break;
        case CAIRO_PATH_CLOSE_PATH: steps.push_back({OutlineKind::close, {}}); break;
        }
    }
    return steps;
}

std::vector<OutlineStep> trace(PangoFont* font, PangoGlyphInfo const& glyph) {
    static Cairo const canvas = makeCanvas();
    PangoGlyphInfo one = glyph;
    one.geometry.x_offset = 0;
    one.geometry.y_offset = 0;
    int cluster = 0;
    PangoGlyphString single{1, &one, &cluster, 0};
    cairo_new_path(canvas.get());
    cairo_move_to(canvas.get(), 0.0, 0.0);
    pango_cairo_glyph_string_path(canvas.get(), font, &single);
    Path const path{cairo_copy_path(canvas.get())};
    return stepsOf(*path);
}

struct FontRelease {
    void operator()(PangoFont* font) const { g_object_unref(font); }
};
using KeptFont = std::unique_ptr<PangoFont, FontRelease>;

struct KeptShape {
    KeptFont font;  // keeps the pointer that the shape is found by
    std::vector<OutlineStep> steps;
};

}  // namespace

std::vector<OutlineStep> const& glyphShape(PangoFont* font, PangoGlyphInfo const& glyph) {
    constexpr std::size_t kMostKept = 20'000;
    static std::map<std::pair<PangoFont*, PangoGlyph>, KeptShape> kept;
    if (auto const known = kept.find({font, glyph.glyph}); known != kept.end()) {
        return known->second.steps;
    }
    if (kept.size() >= kMostKept) kept.clear();
    std::vector<OutlineStep> steps = trace(font, glyph);
    KeptShape& made = kept[{font, glyph.glyph}];
    made.font.reset(static_cast<PangoFont*>(g_object_ref(font)));
    made.steps = std::move(steps);
    return made.steps;
}

}  // namespace tzhost
