#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace tzhost {

// The conversions of a format in order, without flags, width and precision, "%ls" as "%s"; nothing
// when a percent sign opens none. Doubled percent signs are listed too. A translated format fits
// the same arguments when it has those of the original.
[[nodiscard]] std::optional<std::vector<std::wstring>> conversionsOf(std::wstring_view format);

}  // namespace tzhost
