#include "host/display/plot_text.h"

#include <pango/pangocairo.h>

#include <algorithm>
#include <array>
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

// A document tells how wide a glyph is in whole thousandths of the font's size, so that a line of
// fifty letters would end a tenth of a millimetre off. Cairo tells a new place when the font's size
// changes, so each word has a size that differs from that of the one before by no more than this.
constexpr double kTwin = 1.0 + 0x1p-50;

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
    bool const keepsWords = !glyphs.front().rightToLeft && !areJoinedByPlace(glyphs.front());
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
    return clusters;
}

// The glyphs of each word, with the blanks to the right of it, in the order of reading. Those of a
// word stand from left to right: readers turn the letters of Hebrew and Arabic round themselves.
std::vector<AlikeGlyphs> wordsIn(AlikeGlyphs const& glyphs) {
    std::vector<AlikeGlyphs> words;
    bool isAfterBlank = true;
    for (PlotGlyph const& each : glyphs) {
        if (isAfterBlank && !isBlank(each.text)) words.emplace_back();
        if (words.empty()) words.emplace_back();
        words.back().push_back(each);
        if (!each.text.empty()) isAfterBlank = isBlank(each.text);
    }
    if (glyphs.front().rightToLeft) std::reverse(words.begin(), words.end());
    return words;
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
    cairo_matrix_t const matrix = matrixOf(glyphs.front());
    cairo_matrix_t twin = matrix;
    cairo_matrix_scale(&twin, kTwin, kTwin);
    PangoFont* const font = glyphs.front().font.get();
    std::array const fonts{fontOn(matrix, font), fontOn(twin, font)};
    bool const areFinite = std::all_of(glyphs.begin(), glyphs.end(), [&](PlotGlyph const& each) {
        LayoutPoint const at = sheet_.place(each.origin);
        return std::isfinite(at.x) && std::isfinite(at.y);
    });
    if (!fonts[0] || !fonts[1] || !areFinite) return false;
    for (AlikeGlyphs const& word : wordsIn(glyphs)) {
        cairo_set_scaled_font(cairo_, fonts[words_++ % fonts.size()].get());
        showWord(word);
    }
    return true;
}

void TextPainter::showWord(AlikeGlyphs const& word) {
    std::string text;
    std::vector<cairo_glyph_t> placed;
    for (PlotGlyph const& each : word) {
        text += each.text;
        if (each.glyph == PANGO_GLYPH_EMPTY) continue;
        LayoutPoint const at = sheet_.place(each.origin);
        placed.push_back({each.glyph, at.x, at.y});
    }
    std::vector<cairo_text_cluster_t> const clusters = clustersOf(word);
    cairo_show_text_glyphs(cairo_, text.data(), static_cast<int>(text.size()), placed.data(),
                           static_cast<int>(placed.size()), clusters.data(),
                           static_cast<int>(clusters.size()),
                           static_cast<cairo_text_cluster_flags_t>(0));
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
