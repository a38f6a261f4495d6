#include "host/shaping/shaper.h"

#include <pango/pango.h>

#include <algorithm>
#include <memory>

#include "host/shaping/itemizer.h"
#include "host/shaping/shape_engine.h"

namespace tzhost {
namespace {

struct GlyphsFree {
    void operator()(PangoGlyphString* glyphs) const { pango_glyph_string_free(glyphs); }
};
using Glyphs = std::unique_ptr<PangoGlyphString, GlyphsFree>;

void markBreaks(Utf8Text const& utf8, ShapedText& result) {
    std::size_t const count = result.characters.size();
    std::vector<PangoLogAttr> attributes(count + 1);
    pango_get_log_attrs(utf8.bytes.c_str(), static_cast<int>(utf8.bytes.size()), -1,
                        pango_context_get_language(ShapeEngine::instance().context()),
                        attributes.data(), static_cast<int>(attributes.size()));
    for (std::size_t i = 0; i < count; ++i) {
        result.characters[i].mayBreakBefore = attributes[i].is_line_break != 0;
        result.characters[i].isBlank = attributes[i].is_white != 0;
        result.characters[i].opensLetter = attributes[i].is_cursor_position != 0;
    }
}

// Adds the advances of one shaped item whose characters begin at `first`.
void addAdvances(PangoGlyphString const& glyphs,
                 Utf8Text const& utf8,
                 std::size_t first,
                 double capHeight,
                 ShapedText& result) {
    auto const begin = utf8.starts.begin();
    for (int i = 0; i < glyphs.num_glyphs; ++i) {
        int const byte = utf8.starts[first] + glyphs.log_clusters[i];
        // The starts ascend, so that the character of a byte is found without counting.
        auto const place = std::lower_bound(begin, utf8.starts.end(), byte);
        auto const character = static_cast<std::size_t>(place - begin);
        result.characters[std::min(character, result.characters.size() - 1)].advance +=
            glyphs.glyphs[i].geometry.width / capHeight;
    }
}

}  // namespace

ShapedText
shapeText(std::wstring const& text, std::vector<ShapeSpan> const& spans, Ligatures ligatures) {
    ShapedText result;
    result.characters.resize(text.size());
    if (text.empty()) {
        return result;
    }
    Utf8Text const utf8 = utf8Of(text);
    int const size = static_cast<int>(utf8.bytes.size());
    // The first strong letter decides the direction of the whole.
    std::vector<TextItem> const items = itemize(utf8, spans, PANGO_DIRECTION_WEAK_LTR, ligatures);
    Glyphs const glyphs{pango_glyph_string_new()};
    std::size_t first = 0;
    for (std::size_t i = 0; i < items.size(); ++i) {
        PangoItem const& item = *items[i].item;
        double const capHeight = ShapeEngine::instance().face(spans[items[i].span].face).capHeight;
        pango_shape_full(utf8.bytes.c_str() + item.offset, item.length, utf8.bytes.c_str(), size,
                         &item.analysis, glyphs.get());
        addAdvances(*glyphs, utf8, first, capHeight, result);
        first += static_cast<std::size_t>(item.num_chars);
        if (i > 0 && items[i].continues(items[i - 1]))
            result.items.back().end = first;
        else
            result.items.push_back({first, item.analysis.level});
    }
    markBreaks(utf8, result);
    return result;
}

ShapedLine shapeLine(std::wstring const& text, LayoutFace const& face, Ligatures ligatures) {
    std::vector<ShapeSpan> const whole{{text.size(), face}};
    ShapedText const shaped = shapeText(text, whole, ligatures);
    ShapedLine line;
    for (ShapedCharacter const& character : shaped.characters) {
        line.advance += character.advance;
    }
    // In a text that reads from the left something stands at level 0, and nothing in any other.
    line.rightToLeft = !shaped.items.empty() &&
                       std::none_of(shaped.items.begin(), shaped.items.end(),
                                    [](ShapedItem const& item) { return item.level == 0; });
    return line;
}

std::vector<std::wstring> splitLetters(std::wstring const& text, LayoutFace const& face) {
    std::vector<std::wstring> letters;
    std::vector<ShapeSpan> const whole{{text.size(), face}};
    ShapedText const shaped = shapeText(text, whole, Ligatures::off);
    for (std::size_t i = 0; i < text.size(); ++i) {
        if (letters.empty() || shaped.characters[i].opensLetter) {
            letters.emplace_back();
        }
        letters.back() += text[i];
    }
    return letters;
}

}  // namespace tzhost
