#pragma once

#include <pango/pangocairo.h>

#include <map>
#include <string>
#include <vector>

#include "host/shaping/glyph_types.h"

// The Pango objects that shaping and outlines use, set up so that nothing is rounded to pixels.
namespace tzhost {

// The reference size in Pango units. It is a multiple of the units per em of all usual fonts (1000
// and 2048), so that their advances come out exactly.
inline constexpr int kReferenceSize = 1000 * PANGO_SCALE;

// A text in UTF-8 with the byte at which each character starts, the end included.
struct Utf8Text {
    std::string bytes;
    std::vector<int> starts;
};

[[nodiscard]] Utf8Text utf8Of(std::wstring const& text);

// A face at the reference size. `capHeight` is its height of capitals in Pango units; `font` is
// null when the font library has none at all.
struct EngineFace {
    PangoFontDescription* description = nullptr;
    PangoFont* font = nullptr;
    double capHeight = 0.0;
};

class ShapeEngine {
public:
    // The one engine of the process; it is never taken down, since fonts outlive every drawing.
    [[nodiscard]] static ShapeEngine& instance();

    [[nodiscard]] PangoContext* context() const { return context_; }
    // Valid for the life of the process.
    [[nodiscard]] EngineFace const& face(LayoutFace const& face);

private:
    ShapeEngine();

    PangoContext* context_;
    std::map<std::wstring, EngineFace> faces_;
};

}  // namespace tzhost
