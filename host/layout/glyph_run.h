#pragma once

#include <string>

#include "host/layout/text_line.h"
#include "host/shaping/shaper.h"

// The step from a look to a run of letters.
namespace tzhost {

// From one letter of a vertical text to the next, in text heights.
inline constexpr double kVerticalStep = 3.0 / 2.0;

// A factor that letters can be drawn with: the given one, or 1 when it is not above 0 and finite.
[[nodiscard]] double usableFactor(double factor);
// A slant that letters can be drawn with: 350 degrees are -10, and beyond 85 either way they would
// be endless.
[[nodiscard]] double usableSlant(double radians);

// Whether the letters of a text may join.
[[nodiscard]] Ligatures ligaturesOf(WholeText const& whole);

// What an advance in heights of capitals is multiplied by.
[[nodiscard]] double advanceScale(LineFormat const& format, WholeText const& whole);

// A run of `text` at the start of a baseline; its advance is left at 0.
[[nodiscard]] GlyphRun
makeGlyphRun(std::wstring const& text, LineFormat const& format, WholeText const& whole);

// The same for a text that stands alone, with its own advance and direction.
[[nodiscard]] GlyphRun
shapeGlyphRun(std::wstring const& text, LineFormat const& format, WholeText const& whole);

}  // namespace tzhost
