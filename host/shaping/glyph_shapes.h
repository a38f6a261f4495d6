#pragma once

#include <pango/pango.h>

#include <vector>

#include "host/shaping/text_outline.h"

// The outlines of single glyphs, traced once: a text asks for the same few again and again.
namespace tzhost {

// The outline of a glyph at the reference size, in Pango units, y down from the baseline, without
// the glyph's own offsets. Valid until the next call.
[[nodiscard]] std::vector<OutlineStep> const& glyphShape(PangoFont* font,
                                                         PangoGlyphInfo const& glyph);

}  // namespace tzhost
