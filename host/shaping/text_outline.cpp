#include "host/shaping/text_outline.h"

#include <pango/pango.h>

#include <cmath>
#include <memory>
#include <string_view>
#include <vector>

#include "host/shaping/glyph_shapes.h"
#include "host/shaping/itemizer.h"
#include "host/shaping/shape_engine.h"

namespace tzhost {
namespace {

struct ListFree {
    void operator()(GList* list) const { g_list_free(list); }
};
using List = std::unique_ptr<GList, ListFree>;

struct GlyphsFree {
    void operator()(PangoGlyphString* glyphs) const { pango_glyph_string_free(glyphs); }
};
using Glyphs = std::unique_ptr<PangoGlyphString, GlyphsFree>;

// The characters of the cluster that begins, from left to right, at a glyph; none when it began
// before.
std::string clusterAt(std::string_view text, PangoGlyphString const& glyphs, int index) {
    int const* const starts = glyphs.log_clusters;
    int const start = starts[index];
    if (index > 0 && starts[index - 1] == start) return {};
    // Clusters are read to the right or to the left.
    int end = static_cast<int>(text.size());
    if (index > 0 && starts[index - 1] > start) {
        end = starts[index - 1];
    } else {
        int next = index;
        while (next < glyphs.num_glyphs && starts[next] == start)
            ++next;
        if (next < glyphs.num_glyphs && starts[next] > start) end = starts[next];
    }
    return std::string(
        text.substr(static_cast<std::size_t>(start), static_cast<std::size_t>(end - start)));
}

class Outliner {
public:
    Outliner(GlyphRun const& run, LetterTaker const& take)
        : run_(run), take_(take), face_(ShapeEngine::instance().face(run.face)),
          scale_(run.height / face_.capHeight), slant_(std::tan(run.oblique)) {
        double const mirrorX = run.mirroredX ? -scale_ : scale_;
        double const mirrorY = run.mirroredY ? -scale_ : scale_;
        letter_.along = {mirrorX * run.widthFactor, 0.0};
        letter_.down = {-mirrorX * slant_, -mirrorY};
        letter_.spread = run.tracking != 1.0;
    }

    void outline();

private:
    void addItem(PangoItem const& item, Utf8Text const& utf8, PangoGlyphString& glyphs);
    void addGlyph(PangoGlyphInfo const& glyph);
    // Places a point given in Pango units from the pen, y down.
    [[nodiscard]] LayoutPoint place(LayoutPoint const& point) const;

    GlyphRun const& run_;
    LetterTaker const& take_;
    EngineFace const& face_;
    double scale_;  // drawing units in a Pango unit
    double slant_;
    double pen_ = 0.0;  // along the baseline, from the run's start
    OutlinedLetter letter_;
};

void Outliner::outline() {
    Utf8Text const utf8 = utf8Of(run_.text);
    std::vector<ShapeSpan> const whole{{run_.text.size(), run_.face}};
    PangoDirection const direction = run_.rightToLeft ? PANGO_DIRECTION_RTL : PANGO_DIRECTION_LTR;
    Ligatures const ligatures = run_.tracking != 1.0 ? Ligatures::off : Ligatures::on;
    std::vector<TextItem> const items = itemize(utf8, whole, direction, ligatures);
    List reading;
    for (auto each = items.rbegin(); each != items.rend(); ++each)
        reading.reset(g_list_prepend(reading.release(), each->item.get()));
    List const inOrder{pango_reorder_items(reading.get())};
    Glyphs const glyphs{pango_glyph_string_new()};
    for (GList* node = inOrder.get(); node != nullptr; node = node->next)
        addItem(*static_cast<PangoItem const*>(node->data), utf8, *glyphs);
}

void Outliner::addItem(PangoItem const& item, Utf8Text const& utf8, PangoGlyphString& glyphs) {
    pango_shape_full(utf8.bytes.c_str() + item.offset, item.length, utf8.bytes.c_str(),
                     static_cast<int>(utf8.bytes.size()), &item.analysis, &glyphs);
    letter_.font = {};
    if (item.analysis.font) {
        letter_.font = GlyphFont(static_cast<PangoFont*>(g_object_ref(item.analysis.font)),
                                 [](PangoFont* font) { g_object_unref(font); });
    }
    letter_.rightToLeft = item.analysis.level % 2 != 0;
    std::string_view const text =
        std::string_view(utf8.bytes)
            .substr(static_cast<std::size_t>(item.offset), static_cast<std::size_t>(item.length));
    for (int i = 0; i < glyphs.num_glyphs; ++i) {
        letter_.text = clusterAt(text, glyphs, i);
        letter_.at = static_cast<std::size_t>(item.offset + glyphs.log_clusters[i]);
        addGlyph(glyphs.glyphs[i]);
    }
}

void Outliner::addGlyph(PangoGlyphInfo const& glyph) {
    letter_.steps.clear();
    letter_.start = place({0.0, 0.0});
    letter_.glyph = glyph.glyph;
    LayoutPoint const offset{static_cast<double>(glyph.geometry.x_offset),
                             static_cast<double>(glyph.geometry.y_offset)};
    letter_.origin = place(offset);
    if (letter_.font) {
        for (OutlineStep step : glyphShape(letter_.font.get(), glyph)) {
            for (LayoutPoint& point : step.points)
                point = place({point.x + offset.x, point.y + offset.y});
            letter_.steps.push_back(step);
        }
    }
    pen_ += glyph.geometry.width * scale_ * run_.widthFactor * run_.tracking;
    letter_.end = place({0.0, 0.0});
    take_(letter_);
}

LayoutPoint Outliner::place(LayoutPoint const& point) const {
    double const y = -point.y * scale_;
    double const x = pen_ + point.x * scale_ * run_.widthFactor + y * slant_;
    return {run_.x + (run_.mirroredX ? -x : x), run_.y + (run_.mirroredY ? -y : y)};
}

}  // namespace

std::size_t OutlineStep::pointCount() const {
    switch (kind) {
    case OutlineKind::move:
    case OutlineKind::line: return 1;
    case OutlineKind::curve: return 3;
    case OutlineKind::close: break;
    }
    return 0;
}

std::vector<OutlineStep> const& outlineOf(GlyphFont const& font, unsigned int glyph) {
    PangoGlyphInfo info{};
    info.glyph = glyph;
    return glyphShape(font.get(), info);
}

void outlineLetters(GlyphRun const& run, LetterTaker const& take) {
    Outliner(run, take).outline();
}

}  // namespace tzhost
