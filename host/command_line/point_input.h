#pragma once

// Points, lengths and angles as a user types them. Points are in the user system.

#include <optional>
#include <string_view>

#include "tz/ge/point3d.h"
#include "tz/text/string.h"

namespace tzhost {

// "x,y", "x,y,z", "distance<angle", each after "@" for one from `last`, or "@" alone for
// `last`. Lengths stand in any linear unit; a bare angle in the drawing's unit. Nothing for any
// other text.
[[nodiscard]] std::optional<TzGePoint3d> readPoint(std::wstring_view text, TzGePoint3d const& last);
// A length in any unit.
[[nodiscard]] std::optional<double> readDistance(std::wstring_view text);
// An angle in radians; a bare number is in the drawing's unit.
[[nodiscard]] std::optional<double> readAngle(std::wstring_view text);
// Both as the drawing's units write them; neither is infinite.
[[nodiscard]] TzString shownDistance(double value);
[[nodiscard]] TzString shownAngle(double radians);

// The last point that was given, which "@" stands for: the variable LASTPOINT. Setting it is no
// event.
[[nodiscard]] TzGePoint3d lastPoint();
void setLastPoint(TzGePoint3d const& user);
// A point as an answer, read from the last one: it becomes the last point itself.
[[nodiscard]] std::optional<TzGePoint3d> takePoint(std::wstring_view answer);

}  // namespace tzhost
