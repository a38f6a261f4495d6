#include "host/shaping/itemizer.h"

#include <algorithm>
#include <iterator>
#include <new>

namespace tzhost {
namespace {

struct AttributesFree {
    void operator()(PangoAttrList* list) const { pango_attr_list_unref(list); }
};
using Attributes = std::unique_ptr<PangoAttrList, AttributesFree>;

// Ligatures that a script does not need; those of Arabic stay.
constexpr char const* kNoLigatures = "liga=0, clig=0, dlig=0, hlig=0";

Attributes
attributesOf(Utf8Text const& utf8, std::vector<ShapeSpan> const& spans, Ligatures ligatures) {
    Attributes attributes{pango_attr_list_new()};
    std::size_t start = 0;
    for (ShapeSpan const& span : spans) {
        EngineFace const& face = ShapeEngine::instance().face(span.face);
        PangoAttribute* const attribute = pango_attr_font_desc_new(face.description);
        attribute->start_index = static_cast<guint>(utf8.starts[start]);
        start += span.length;
        attribute->end_index = static_cast<guint>(utf8.starts[start]);
        pango_attr_list_insert(attributes.get(), attribute);
    }
    if (ligatures == Ligatures::off) {
        pango_attr_list_insert(attributes.get(), pango_attr_font_features_new(kNoLigatures));
    }
    return attributes;
}

struct CjkRow {
    gunichar first;
    gunichar last;
    CjkKind kind;
};

// Stretches of Chinese, Japanese and Korean characters, in order.
constexpr CjkRow kCjkRows[] = {
    {0x1100, 0x11FF, CjkKind::letter}, {0x2E80, 0x2FDF, CjkKind::letter},
    {0x3000, 0x3004, CjkKind::mark},   {0x3005, 0x3007, CjkKind::letter},
    {0x3008, 0x3030, CjkKind::mark},   {0x3031, 0x303C, CjkKind::letter},
    {0x303D, 0x303F, CjkKind::mark},   {0x3040, 0x30FA, CjkKind::letter},
    {0x30FB, 0x30FB, CjkKind::mark},   {0x30FC, 0x318F, CjkKind::letter},
    {0x3190, 0x319F, CjkKind::mark},   {0x31A0, 0x31FF, CjkKind::letter},
    {0x3200, 0x33FF, CjkKind::mark},   {0x3400, 0x4DBF, CjkKind::letter},
    {0x4E00, 0x9FFF, CjkKind::letter}, {0xA960, 0xA97F, CjkKind::letter},
    {0xAC00, 0xD7FF, CjkKind::letter}, {0xF900, 0xFAFF, CjkKind::letter},
    {0xFE10, 0xFE1F, CjkKind::mark},   {0xFE30, 0xFE4F, CjkKind::mark},
    {0xFF00, 0xFF0F, CjkKind::mark},   {0xFF10, 0xFF19, CjkKind::letter},
    {0xFF1A, 0xFF20, CjkKind::mark},   {0xFF21, 0xFF3A, CjkKind::letter},
    {0xFF3B, 0xFF40, CjkKind::mark},   {0xFF41, 0xFF5A, CjkKind::letter},
    {0xFF5B, 0xFF65, CjkKind::mark},   {0xFF66, 0xFFDC, CjkKind::letter},
    {0xFFE0, 0xFFEF, CjkKind::mark},   {0x20000, 0x3FFFF, CjkKind::letter},
};

CjkKind cjkKindOf(gunichar c) {
    if (c < kCjkRows[0].first) return CjkKind::none;
    auto const* const row =
        std::lower_bound(std::begin(kCjkRows), std::end(kCjkRows), c,
                         [](CjkRow const& each, gunichar value) { return each.last < value; });
    return row != std::end(kCjkRows) && c >= row->first ? row->kind : CjkKind::none;
}

// What an item holds that the face of its span lacks: a letter when there is one.
CjkKind kindOf(PangoItem const& item, char const* text, PangoFont* own) {
    CjkKind kind = CjkKind::none;
    for (int i = 0; i < item.num_chars; ++i, text = g_utf8_next_char(text)) {
        gunichar const c = g_utf8_get_char(text);
        CjkKind const here = cjkKindOf(c);
        if (here == CjkKind::none || (own != nullptr && pango_font_has_char(own, c))) continue;
        if (here == CjkKind::letter) return here;
        kind = here;
    }
    return kind;
}

bool hasAll(PangoFont* font, PangoItem const& item, char const* text) {
    for (int i = 0; i < item.num_chars; ++i, text = g_utf8_next_char(text)) {
        if (pango_font_has_char(font, g_utf8_get_char(text)) == 0) return false;
    }
    return true;
}

// Goes over the items of a text in one direction and hands the font of a letter on to those that
// come next in its span.
class FontGiver {
public:
    explicit FontGiver(Utf8Text const& utf8) : utf8_(utf8) {}

    // Kinds above `most` keep their font.
    void pass(TextItem& each, CjkKind most) {
        if (each.span != span_) font_ = nullptr;
        span_ = each.span;
        CjkKind const kind = each.lacking;
        if (kind == CjkKind::none) return;
        if (font_ != nullptr && kind <= most) adopt(*each.item);
        if (kind == CjkKind::letter) font_ = each.item->analysis.font;
    }

private:
    void adopt(PangoItem& item) const {
        PangoFont*& own = item.analysis.font;
        if (own == font_ || !hasAll(font_, item, utf8_.bytes.c_str() + item.offset)) return;
        g_object_ref(font_);
        if (own != nullptr) g_object_unref(own);
        own = font_;
    }

    Utf8Text const& utf8_;
    PangoFont* font_ = nullptr;
    std::size_t span_ = 0;
};

// Letters and marks take the font of a letter before them; marks before all letters take that of
// the first letter.
void shareFonts(std::vector<TextItem>& items, Utf8Text const& utf8) {
    FontGiver forwards(utf8);
    for (TextItem& each : items)
        forwards.pass(each, CjkKind::letter);
    FontGiver backwards(utf8);
    for (auto each = items.rbegin(); each != items.rend(); ++each)
        backwards.pass(*each, CjkKind::mark);
}

// Pango ends the process when memory runs out. So the room that it takes for a long text is asked
// for and given back, which fails where a lack of it can still be told.
void makeSureOfRoom(std::size_t letters) {
    constexpr std::size_t kLongText = 10'000;
    constexpr std::size_t kBytesOfALetter = 256;
    if (letters < kLongText) return;
    ::operator delete(::operator new(letters* kBytesOfALetter));
}

}  // namespace

bool TextItem::continues(TextItem const& ahead) const {
    return lacking != CjkKind::none && ahead.lacking != CjkKind::none && span == ahead.span &&
           analysis().font == ahead.analysis().font && analysis().level == ahead.analysis().level;
}

std::vector<TextItem> itemize(Utf8Text const& utf8,
                              std::vector<ShapeSpan> const& spans,
                              PangoDirection direction,
                              Ligatures ligatures) {
    makeSureOfRoom(utf8.starts.size());
    GList* const list = pango_itemize_with_base_dir(
        ShapeEngine::instance().context(), direction, utf8.bytes.c_str(), 0,
        static_cast<int>(utf8.bytes.size()), attributesOf(utf8, spans, ligatures).get(), nullptr);
    std::vector<TextItem> items;
    items.reserve(g_list_length(list));
    for (GList* node = list; node != nullptr; node = node->next) {
        items.push_back(
            {std::unique_ptr<PangoItem, ItemFree>(static_cast<PangoItem*>(node->data))});
    }
    g_list_free(list);
    std::size_t span = 0;
    int first = 0;
    int spanEnd = static_cast<int>(spans.front().length);
    for (TextItem& each : items) {
        while (first >= spanEnd && span + 1 < spans.size()) {
            spanEnd += static_cast<int>(spans[++span].length);
        }
        first += each.item->num_chars;
        each.span = span;
        each.lacking = kindOf(*each.item, utf8.bytes.c_str() + each.item->offset,
                              ShapeEngine::instance().face(spans[span].face).font);
    }
    shareFonts(items, utf8);
    return items;
}

}  // namespace tzhost
