#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "host/shaping/glyph_types.h"

// Shapes text with Pango and measures it in heights of capitals, so that the caller only scales.
// All is shaped at one reference size without hinting or rounding, whatever the height of the text
// in the drawing: texts of 1e-6 and of 1e9 units come out alike.
//
// The fonts are opened once and kept for the life of the process. Main thread only.
namespace tzhost {

// A stretch of characters of one face; the spans of a text follow each other without gaps.
struct ShapeSpan {
    std::size_t length = 0;
    LayoutFace face;
};

// A stretch of characters of one direction, odd levels running from right to left. Items follow
// each other in reading order without gaps, and none crosses the end of a span.
struct ShapedItem {
    std::size_t end = 0;
    int level = 0;
};

// What is known of each character. The advance of a cluster stands at its first character.
struct ShapedCharacter {
    double advance = 0.0;  // in heights of capitals of the span's face
    bool mayBreakBefore = false;
    bool isBlank = false;
    bool opensLetter = true;  // false for what joins the character before it, such as an accent
};

struct ShapedText {
    std::vector<ShapedCharacter> characters;
    std::vector<ShapedItem> items;
};

// Whether letters may join into one shape, such as f and i. They may not where each letter has its
// own place: down the page, and when tracking parts them.
enum class Ligatures { off, on };

// Shapes a paragraph. Values in `text` that are no Unicode scalars show as U+FFFD.
[[nodiscard]] ShapedText
shapeText(std::wstring const& text, std::vector<ShapeSpan> const& spans, Ligatures ligatures);

// A text of one face that is never broken: its advance in heights of capitals, and which way it
// reads as a whole, by its first strong letter.
struct ShapedLine {
    double advance = 0.0;
    bool rightToLeft = false;
};
[[nodiscard]] ShapedLine
shapeLine(std::wstring const& text, LayoutFace const& face, Ligatures ligatures);

// The letters of a text, each with the accents and joiners that belong to it.
[[nodiscard]] std::vector<std::wstring> splitLetters(std::wstring const& text,
                                                     LayoutFace const& face);

}  // namespace tzhost
