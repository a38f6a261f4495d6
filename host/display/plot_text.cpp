#include "host/display/plot_text.h"

#include <pango/pangocairo.h>

#include <algorithm>
#include <cmath>
#include <memory>
#include <string_view>
#include <utility>

#include "host/display/plot_clip.h"
#include "host/shaping/font_rights.h"

namespace tzhost {
namespace {

struct ScaledFontFree {
    void operator()(cairo_scaled_font_t* font) const { cairo_scaled_font_destroy(font); }
};
using ScaledFont = std::unique_ptr<cairo_scaled_font_t, ScaledFontFree>;
struct OptionsFree {
    void operator()(cairo_font_options_t* options) const { cairo_font_options_destroy(options); }
};
using FontOptions = std::unique_ptr<cairo_font_options_t, OptionsFree>;

// The font of a glyph as it lies on the page; null when it cannot lie so.
ScaledFont fontOn(cairo_matrix_t const& toPage, PangoFont* font) {
    // A change of the fonts' unit, which is a thousand pixels, to that of the page.
    constexpr double kLeastSlant = 1e-4;
    double const area = std::fabs(toPage.xx * toPage.yy - toPage.xy * toPage.yx);
    double const sides = std::hypot(toPage.xx, toPage.yx) * std::hypot(toPage.xy, toPage.yy);
    if (!(area > sides * kLeastSlant) || !std::isfinite(sides)) return nullptr;
    cairo_scaled_font_t* const reference = pango_cairo_font_get_scaled_font(PANGO_CAIRO_FONT(font));
    if (!reference) return nullptr;
    cairo_matrix_t own;
    cairo_scaled_font_get_font_matrix(reference, &own);
    cairo_matrix_t matrix = toPage;
    cairo_matrix_scale(&matrix, PANGO_SCALE, PANGO_SCALE);
    cairo_matrix_multiply(&matrix, &own, &matrix);
    cairo_matrix_t identity;
    cairo_matrix_init_identity(&identity);
    FontOptions const options(cairo_font_options_create());
    cairo_scaled_font_get_font_options(reference, options.get());
    ScaledFont made(cairo_scaled_font_create(cairo_scaled_font_get_font_face(reference), &matrix,
                                             &identity, options.get()));
    bool const isGood = cairo_scaled_font_status(made.get()) == CAIRO_STATUS_SUCCESS;
    return isGood ? std::move(made) : nullptr;
}

// Where letters stand side by side along the page's edge, as their font says, a reader joins them
// to words by their places. Of others it would make words of one letter.
bool areJoinedByPlace(PlotGlyph const& glyph) {
    constexpr double kLeastSlope = 1e-3;
    double const x = std::fabs(glyph.along.x);
    double const y = std::fabs(glyph.along.y);
    bool const isMirrored = glyph.along.x * glyph.down.y > glyph.along.y * glyph.down.x;
    return std::min(x, y) <= kLeastSlope * std::max(x, y) && !isMirrored && !glyph.spread;
}

bool isBlank(std::string_view text) {
    return text.find_first_not_of(" \u00A0\t") == std::string_view::npos;
}

// Which characters the glyphs stand for: each glyph for its own, or those of a word for all of it.
std::vector<cairo_text_cluster_t> clustersOf(AlikeGlyphs const& glyphs) {
    bool const keepsWords = !areJoinedByPlace(glyphs.front());
    bool isInWord = false;
    std::vector<cairo_text_cluster_t> clusters;
    for (PlotGlyph const& each : glyphs) {
        bool const isOfWord = each.text.empty() ? isInWord : !isBlank(each.text);
        bool const goesOn = each.text.empty() || (keepsWords && isInWord && isOfWord);
        if (clusters.empty() || !goesOn) clusters.push_back({0, 0});
        clusters.back().num_bytes += static_cast<int>(each.text.size());
        if (each.glyph != PANGO_GLYPH_EMPTY) ++clusters.back().num_glyphs;
        isInWord = isOfWord;
    }
    if (glyphs.front().rightToLeft) std::reverse(clusters.begin(), clusters.end());
    return clusters;
}

}  // namespace

void addPath(cairo_t* cairo, std::vector<OutlineStep> const& path) {
    cairo_new_path(cairo);
    for (auto const& [kind, at] : path) {
        switch (kind) {
        case OutlineKind::move: cairo_move_to(cairo, at[0].x, at[0].y); break;
        case OutlineKind::line: cairo_line_to(cairo, at[0].x, at[0].y); break;
        case OutlineKind::curve:
            cairo_curve_to(cairo, at[0].x, at[0].y, at[1].x, at[1].y, at[2].x, at[2].y);
            break;
        case OutlineKind::close: cairo_close_path(cairo); break;
        }
    }
}

cairo_matrix_t TextPainter::matrixOf(PlotGlyph const& glyph) const {
    double const scale = sheet_.scale;
    return {glyph.along.x * scale,
            -glyph.along.y * scale,
            glyph.down.x * scale,
            -glyph.down.y * scale,
            0.0,
            0.0};
}

bool TextPainter::canBeText(PlotGlyph const& glyph) {
    if (!glyph.font || (glyph.glyph & PANGO_GLYPH_UNKNOWN_FLAG) != 0) return false;
    auto const [at, isNew] = usable_.try_emplace(glyph.font, false);
    if (isNew) {
        bool const isLocked = !mayBeEmbedded(glyph.font);
        if (isLocked) lockedFaces_.insert(faceNameOf(glyph.font));
        at->second = !isLocked && hasOutlines(glyph.font);
    }
    return at->second;
}

bool TextPainter::showAsText(AlikeGlyphs const& glyphs) {
    if (!canBeText(glyphs.front())) return false;
    ScaledFont const font = fontOn(matrixOf(glyphs.front()), glyphs.front().font.get());
    if (!font) return false;
    std::string const text = wordsOf(glyphs);
    std::vector<cairo_glyph_t> placed;
    for (PlotGlyph const& each : glyphs) {
        if (each.glyph == PANGO_GLYPH_EMPTY) continue;
        LayoutPoint const at = sheet_.place(each.origin);
        if (!std::isfinite(at.x) || !std::isfinite(at.y)) return false;
        placed.push_back({each.glyph, at.x, at.y});
    }
    std::vector<cairo_text_cluster_t> const clusters = clustersOf(glyphs);
    cairo_set_scaled_font(cairo_, font.get());
    cairo_show_text_glyphs(cairo_, text.data(), static_cast<int>(text.size()), placed.data(),
                           static_cast<int>(placed.size()), clusters.data(),
                           static_cast<int>(clusters.size()),
                           glyphs.front().rightToLeft ? CAIRO_TEXT_CLUSTER_FLAG_BACKWARD
                                                      : static_cast<cairo_text_cluster_flags_t>(0));
    return true;
}

void TextPainter::fillOutlines(AlikeGlyphs const& glyphs) {
    LayoutBox const nearby = surroundingsOf(sheet_);
    for (PlotGlyph const& each : glyphs) {
        if (!each.font || each.glyph == PANGO_GLYPH_EMPTY) continue;
        std::vector<OutlineStep> path = outlineOf(each.font, each.glyph);
        for (OutlineStep& step : path) {
            for (LayoutPoint& point : step.points) {
                point =
                    sheet_.place({each.origin.x + each.along.x * point.x + each.down.x * point.y,
                                  each.origin.y + each.along.y * point.x + each.down.y * point.y});
            }
        }
        if (reachesBeyond(path, nearby)) path = clippedArea(path, nearby);
        addPath(cairo_, path);
        cairo_fill(cairo_);
    }
}

void TextPainter::show(PlotShape const& letters) {
    eachAlike(
        letters, sheet_, [&](PlotGlyph const& glyph) { return canBeText(glyph); },
        [&](AlikeGlyphs const& glyphs) {
            if (!showAsText(glyphs)) fillOutlines(glyphs);
        });
}

}  // namespace tzhost
