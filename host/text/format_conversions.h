#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace tzhost {

// The conversions of a format in order, without flags, width and precision, "%ls" as "%s"; nothing
// when a percent sign begins no conversion. Doubled percent signs are listed too. A translated
// format fits the arguments of the original when both have the same conversions.
[[nodiscard]] std::optional<std::vector<std::wstring>> conversionsOf(std::wstring_view format);

}  // namespace tzhost
