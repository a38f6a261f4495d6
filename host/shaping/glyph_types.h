#pragma once

#include <string>

// Letters as they are shaped and drawn: their face, their colour and where they stand. Lengths are
// drawing units in the frame of a layout, x along the text's direction and y up. A text height is
// the height of capitals. Angles are radians.
namespace tzhost {

// A colour as the markup gives it; what an index looks like is the display's business.
enum class TextColorKind { entity, index, rgb };

// `index` counts when the kind is index (0 by block, 256 by layer), `rgb` (0x00BBGGRR) when it is
// rgb.
struct TextColor {
    TextColorKind kind = TextColorKind::entity;
    int index = 256;
    unsigned int rgb = 0;

    friend bool operator==(TextColor const&, TextColor const&) = default;
};

struct LayoutPoint {
    double x = 0.0;
    double y = 0.0;
};

// The face that letters are drawn with, after stroke fonts and files were turned into faces.
struct LayoutFace {
    std::wstring typeface;
    bool bold = false;
    bool italic = false;

    friend bool operator==(LayoutFace const&, LayoutFace const&) = default;
};

// Letters of one look on one line. `x`, `y` is the left end of the baseline (of a vertical text: of
// this letter's own baseline); `advance` the length along it with tracking and width factor
// applied.
struct GlyphRun {
    std::wstring text;  // in reading order
    bool rightToLeft = false;
    double x = 0.0;
    double y = 0.0;
    double height = 0.0;
    double advance = 0.0;
    double widthFactor = 1.0;
    double tracking = 1.0;
    double oblique = 0.0;
    bool mirroredX = false;  // drawn backward, about `x`
    bool mirroredY = false;  // drawn upside down, about `y`
    LayoutFace face;
    TextColor color;
};

}  // namespace tzhost
