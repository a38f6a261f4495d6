#include "host/shaping/shape_engine.h"

#include <hb-ot.h>
#include <hb.h>

#include "host/text/utf8.h"

namespace tzhost {
namespace {

// Capitals of a face that has none and does not tell their height, against its size.
constexpr double kUsualCapHeight = 0.7;

constexpr std::size_t kUtf8Limits[] = {0x80, 0x800, 0x10000};

// How many bytes a value takes in UTF-8; what is no Unicode scalar is written as U+FFFD.
int utf8Length(wchar_t c) {
    auto const value = static_cast<std::size_t>(static_cast<unsigned int>(c));
    if (value > 0x10FFFF) {
        return 3;
    }
    int length = 1;
    for (std::size_t const limit : kUtf8Limits) {
        length += value >= limit ? 1 : 0;
    }
    return length;
}

// The height of capitals against the em: that of the letter H as drawn, else what the face
// declares.
double capHeightOf(hb_face_t* face) {
    hb_font_t* const font = hb_font_create(face);  // in units of the face
    hb_ot_font_set_funcs(font);
    hb_codepoint_t glyph = 0;
    hb_glyph_extents_t extents{};
    hb_position_t declared = 0;
    double height = 0.0;
    if (hb_font_get_nominal_glyph(font, U'H', &glyph) != 0 &&
        hb_font_get_glyph_extents(font, glyph, &extents) != 0) {
        height = extents.y_bearing;
    } else if (hb_ot_metrics_get_position(font, HB_OT_METRICS_TAG_CAP_HEIGHT, &declared) != 0) {
        height = declared;
    }
    hb_font_destroy(font);
    double const ratio = height / hb_face_get_upem(face);
    return ratio > 0.0 ? ratio : kUsualCapHeight;
}

}  // namespace

Utf8Text utf8Of(std::wstring const& text) {
    Utf8Text result;
    result.bytes = toUtf8(text);
    result.starts.reserve(text.size() + 1);
    int at = 0;
    for (wchar_t const c : text) {
        result.starts.push_back(at);
        at += utf8Length(c);
    }
    result.starts.push_back(at);
    return result;
}

ShapeEngine& ShapeEngine::instance() {
    static ShapeEngine* const engine = new ShapeEngine;
    return *engine;
}

ShapeEngine::ShapeEngine()
    : context_(pango_font_map_create_context(pango_cairo_font_map_get_default())) {
    cairo_font_options_t* const options = cairo_font_options_create();
    cairo_font_options_set_hint_style(options, CAIRO_HINT_STYLE_NONE);
    cairo_font_options_set_hint_metrics(options, CAIRO_HINT_METRICS_OFF);
    pango_cairo_context_set_font_options(context_, options);
    cairo_font_options_destroy(options);
    pango_context_set_round_glyph_positions(context_, FALSE);
    // The user's locale must not choose among faces, else a drawing looks different elsewhere.
    pango_context_set_language(context_, pango_language_from_string("en"));
}

EngineFace const& ShapeEngine::face(LayoutFace const& face) {
    std::wstring const key =
        face.typeface + (face.bold ? L"|b" : L"|") + (face.italic ? L"i" : L"");
    if (auto const known = faces_.find(key); known != faces_.end()) {
        return known->second;
    }
    std::string const family = toUtf8(face.typeface);
    EngineFace& made = faces_[key];  // nothing throws from here on: no face is kept half made
    made.description = pango_font_description_new();
    pango_font_description_set_family(made.description, family.c_str());
    pango_font_description_set_weight(made.description,
                                      face.bold ? PANGO_WEIGHT_BOLD : PANGO_WEIGHT_NORMAL);
    pango_font_description_set_style(made.description,
                                     face.italic ? PANGO_STYLE_ITALIC : PANGO_STYLE_NORMAL);
    pango_font_description_set_absolute_size(made.description, kReferenceSize);
    made.font = pango_context_load_font(context_, made.description);
    made.capHeight = kUsualCapHeight * kReferenceSize;
    if (made.font != nullptr) {
        made.capHeight =
            capHeightOf(hb_font_get_face(pango_font_get_hb_font(made.font))) * kReferenceSize;
    }
    return made;
}

}  // namespace tzhost
