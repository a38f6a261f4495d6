#pragma once

#include <pango/pango.h>

#include <memory>
#include <vector>

#include "host/shaping/shape_engine.h"
#include "host/shaping/shaper.h"

// Cuts a text into items, each of one font and one direction, the same way for measuring and for
// drawing.
namespace tzhost {

struct ItemFree {
    void operator()(PangoItem* item) const { pango_item_free(item); }
};

// What an item holds that the face of its span lacks: Chinese, Japanese or Korean marks, or letters
// too.
enum class CjkKind { none, mark, letter };

struct TextItem {
    std::unique_ptr<PangoItem, ItemFree> item;
    std::size_t span = 0;  // that holds it
    CjkKind lacking = CjkKind::none;

    [[nodiscard]] PangoAnalysis const& analysis() const { return item->analysis; }
    // Whether this item goes on with the borrowed font and the direction of the one before it, so
    // that both are drawn as one.
    [[nodiscard]] bool continues(TextItem const& ahead) const;
};

// The items of a text in reading order; none crosses the end of a span. A Chinese, Japanese or
// Korean letter or mark that the face of its span lacks takes the font of its neighbours in the
// span, if that has it; only then another one that the font library finds.
[[nodiscard]] std::vector<TextItem> itemize(Utf8Text const& utf8,
                                            std::vector<ShapeSpan> const& spans,
                                            PangoDirection direction,
                                            Ligatures ligatures);

}  // namespace tzhost
