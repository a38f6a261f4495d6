#pragma once

#include "host/layout/layout_types.h"

// Lays out an MTEXT: reads its markup, wraps it, stacks the lines into columns, and places all of
// it by its attachment point.
//
//   MTextLayoutInput input;
//   input.contents = L"General notes\\P1.\tAll sizes in mm.";
//   input.textHeight = 2.5;
//   MTextLayout const layout = layOutMText(input);
//   // layout.height is 2.5 * (1 + 5/3)
//
// Never fails but for memory. The caller keeps the result as long as the input stays the same. The
// work is linear in the text.
namespace tzhost {

[[nodiscard]] MTextLayout layOutMText(MTextLayoutInput const& input);

// The background box of a laid out text: its own box, wider on all sides by what `scale` adds to
// one text height (1.5 adds half a text height).
[[nodiscard]] LayoutBox backgroundBox(MTextLayout const& layout, double textHeight, double scale);

}  // namespace tzhost
