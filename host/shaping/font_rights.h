#pragma once

#include <string>

#include "host/shaping/text_outline.h"

// What a font lets a document do with it.
namespace tzhost {

// Whether a part of the font may lie in a document, as its makers say in the font itself.
[[nodiscard]] bool mayBeEmbedded(GlyphFont const& font);

// Whether its glyphs are outlines; those of some faces are pictures.
[[nodiscard]] bool hasOutlines(GlyphFont const& font);

// The face's name in UTF-8.
[[nodiscard]] std::string faceNameOf(GlyphFont const& font);

}  // namespace tzhost
