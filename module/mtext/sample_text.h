#pragma once

#include "tz/ge/point3d.h"
#include "tz/gi/draw.h"
#include "tz/gi/text_style.h"

// The sample text that both previews of MTEXT show, in the current text style of the drawing.

// Angle of a style whose typeface is made for vertical text, radians: a quarter turn clockwise.
inline constexpr double kVerticalRotation = 4.71238898038469;
// The colour of sample text.
inline constexpr int kSampleColor = 253;

// The rotation that the current style asks for: kVerticalRotation or 0.
[[nodiscard]] double rotationOfCurrentStyle();
// Whether the current style runs from top to bottom.
[[nodiscard]] bool isCurrentStyleVertical();
// The current style at a text size, but never upside down or backward. When there is no current
// style, a plain one that ignores both arguments.
[[nodiscard]] TzGiTextStyle sampleTextStyle(double size, bool vertical);
// The text itself, of the drafter's choice; may be empty.
[[nodiscard]] TzString sampleText();
// Draws one line of it without looking at codes in it.
void drawSampleText(TzGiWorldDraw& draw,
                    TzString const& text,
                    TzGePoint3d const& position,
                    TzGeVector3d const& normal,
                    TzGeVector3d const& direction,
                    TzGiTextStyle const& style);
