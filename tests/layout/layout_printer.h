#pragma once

#include <string>

#include "host/layout/mtext_layout.h"

// Layouts in a compact notation. The tests lay out DejaVu Sans Mono, each of whose letters advances
// 1233 units of its em while its H is 1493 high: with that text height all positions come out in
// whole letters and text heights, and expectations can be counted by hand.
namespace tztest {

inline constexpr double kLetter = 1233.0;
inline constexpr double kCapital = 1493.0;

// A text of DejaVu Sans Mono; its width in letters.
[[nodiscard]] tzhost::MTextLayoutInput monospaced(std::wstring const& contents, double letters);

// Each line as COLUMN:X,BASELINE,ADVANCE, in letters across and text heights up.
[[nodiscard]] std::string printLines(tzhost::MTextLayout const& layout);

// Each run as 'text'@X,Y,ADVANCE with *HEIGHT when it is not 1 text height.
[[nodiscard]] std::string printGlyphRuns(tzhost::MTextLayout const& layout);

// Each rule as u, o, b or s (underline, overline, bar, slash) and X,Y-X,Y.
[[nodiscard]] std::string printRules(tzhost::MTextLayout const& layout);

// LEFT,BOTTOM-RIGHT,TOP
[[nodiscard]] std::string printBox(tzhost::LayoutBox const& box);

}  // namespace tztest
