#pragma once

// Values of system variables and the types they have, as text and back. Numbers follow no locale; a
// real is written in the shortest form that reads back the same.

#include <array>
#include <optional>
#include <string>
#include <string_view>
#include <variant>

namespace tzhost {

enum class VariableType { shortInteger, real, text, point };

using VariablePoint = std::array<double, 3>;

// The alternatives stand in the order of VariableType.
using VariableValue = std::variant<short, double, std::wstring, VariablePoint>;

[[nodiscard]] VariableType typeOf(VariableValue const& value);

// The value that a text means for a variable of that type: digits with a sign, a number, the text
// itself, or "x,y" and "x,y,z". Nothing when the text is no such value or the number is not finite.
[[nodiscard]] std::optional<VariableValue> readValue(VariableType type, std::wstring_view text);

// As readValue takes it.
[[nodiscard]] std::wstring writeValue(VariableValue const& value);

// The shortest text that reads back as the same number, such as "0.2" or "1e+30".
[[nodiscard]] std::wstring writeReal(double value);

// The number that the whole text means. Nothing for an empty text, for one that goes on after the
// number, and for a number that is not finite.
[[nodiscard]] std::optional<double> readReal(std::wstring_view text);

}  // namespace tzhost
