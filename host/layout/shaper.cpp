#include "host/layout/shaper.h"

#include <pango/pango.h>

#include <algorithm>
#include <memory>

#include "host/layout/shape_engine.h"

namespace tzhost {
namespace {

struct AttributesFree {
    void operator()(PangoAttrList* list) const { pango_attr_list_unref(list); }
};
using Attributes = std::unique_ptr<PangoAttrList, AttributesFree>;

struct GlyphsFree {
    void operator()(PangoGlyphString* glyphs) const { pango_glyph_string_free(glyphs); }
};
using Glyphs = std::unique_ptr<PangoGlyphString, GlyphsFree>;

// The faces of a paragraph as Pango wants them, and the height of capitals behind each character.
struct PreparedFaces {
    Attributes attributes{pango_attr_list_new()};
    std::vector<double> capHeights;  // by span
};

PreparedFaces prepareFaces(Utf8Text const& utf8, std::vector<ShapeSpan> const& spans) {
    PreparedFaces prepared;
    std::size_t start = 0;
    for (ShapeSpan const& span : spans) {
        EngineFace const& face = ShapeEngine::instance().face(span.face);
        PangoAttribute* const attribute = pango_attr_font_desc_new(face.description);
        attribute->start_index = static_cast<guint>(utf8.starts[start]);
        start += span.length;
        attribute->end_index = static_cast<guint>(utf8.starts[start]);
        pango_attr_list_insert(prepared.attributes.get(), attribute);
        prepared.capHeights.push_back(face.capHeight);
    }
    return prepared;
}

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

ShapedText shapeText(std::wstring const& text, std::vector<ShapeSpan> const& spans) {
    ShapedText result;
    result.characters.resize(text.size());
    if (text.empty()) {
        return result;
    }
    Utf8Text const utf8 = utf8Of(text);
    int const size = static_cast<int>(utf8.bytes.size());
    PreparedFaces const faces = prepareFaces(utf8, spans);
    // The first strong letter decides the direction of the whole.
    GList* const items =
        pango_itemize_with_base_dir(ShapeEngine::instance().context(), PANGO_DIRECTION_WEAK_LTR,
                                    utf8.bytes.c_str(), 0, size, faces.attributes.get(), nullptr);
    Glyphs const glyphs{pango_glyph_string_new()};
    std::size_t first = 0;
    std::size_t span = 0;
    std::size_t spanEnd = spans.empty() ? text.size() : spans.front().length;
    for (GList* node = items; node != nullptr; node = node->next) {
        auto* const item = static_cast<PangoItem*>(node->data);
        while (first >= spanEnd && span + 1 < spans.size()) {
            spanEnd += spans[++span].length;
        }
        pango_shape_full(utf8.bytes.c_str() + item->offset, item->length, utf8.bytes.c_str(), size,
                         &item->analysis, glyphs.get());
        addAdvances(*glyphs, utf8, first, faces.capHeights[span], result);
        first += static_cast<std::size_t>(item->num_chars);
        result.items.push_back({first, item->analysis.level});
        pango_item_free(item);
    }
    g_list_free(items);
    markBreaks(utf8, result);
    return result;
}

ShapedLine shapeLine(std::wstring const& text, LayoutFace const& face) {
    ShapedText const shaped = shapeText(text, {
                                                  {text.size(), face}
    });
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
    std::vector<ShapedCharacter> const characters = shapeText(text,
                                                              {
                                                                  {text.size(), face}
    })
                                                        .characters;
    for (std::size_t i = 0; i < text.size(); ++i) {
        if (letters.empty() || characters[i].opensLetter) {
            letters.emplace_back();
        }
        letters.back() += text[i];
    }
    return letters;
}

}  // namespace tzhost
