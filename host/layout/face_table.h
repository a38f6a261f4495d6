#pragma once

#include "host/layout/layout_types.h"
#include "host/layout/markup_reader.h"

// Which face draws a font: a typeface itself, a font file the face it holds, a stroke font (a file
// that only the drafting host knows) a face from a table of this host's.
namespace tzhost {

// The face of a text style: its typeface, or else that of its font file.
[[nodiscard]] LayoutFace faceOfStyle(LayoutStyle const& style);

// The face of a font that the markup names. An empty name gives the empty face, which the font
// library draws with its default.
[[nodiscard]] LayoutFace faceOfMarkup(MarkupFont const& font);

}  // namespace tzhost
