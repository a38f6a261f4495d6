#pragma once

// Texts of lengths and angles, for the questions; what tz/ed/units.h offers to modules rests on
// these. False leaves the value alone. No fault point stands in them.

#include <string_view>

namespace tzhost {

// A length in any linear unit.
[[nodiscard]] bool readLength(std::wstring_view text, double& value);
// An angle in any angular unit; a bare number is in `unit`, 0 to 4, anything else being degrees.
[[nodiscard]] bool readAngle(std::wstring_view text, int unit, double& radians);

}  // namespace tzhost
