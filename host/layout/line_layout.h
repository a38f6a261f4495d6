#pragma once

#include <string>

#include "host/layout/layout_types.h"

// Lays out a single line: TEXT, attributes, and whatever is measured as a text of one style.
//
//   LineLayout const line = layOutLine({L"A-12", 0.2, style, {}});
//   // line.box: from the insertion point to the end of the advance and the top of capitals
//
// A vertical style stacks upright letters downwards, centred under the insertion point, 3/2 of the
// text height from one to the next; its box goes from the foot of the last letter to the insertion
// point. Backward and upside-down styles turn text and box over about the insertion point.
namespace tzhost {

[[nodiscard]] LineLayout layOutLine(LineLayoutInput const& input);

// A line's text with its character codes (backslash, U or M, "+" and digits) replaced by what they
// stand for. Anything else stands as written: a single line knows no other markup.
[[nodiscard]] std::wstring decodeLineText(std::wstring const& text);

// Whether a style's typeface has the leading "@" of faces that write from top to bottom.
[[nodiscard]] bool hasVerticalMark(LayoutStyle const& style);

// Whether a style writes from top to bottom: by its flag, or by its typeface's mark.
[[nodiscard]] bool isVerticalStyle(LayoutStyle const& style);

// Takes the "@" off the typeface of a style without the vertical flag. The mark asks whole entities
// to run downwards; a text that is drawn as strokes runs along its direction all the same.
void dropVerticalMark(LayoutStyle& style);

}  // namespace tzhost
