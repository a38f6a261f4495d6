#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "tz/gi/color.h"

// True colours as drawings, events and drafters write them: "#RRGGBB" in capitals; small letters
// are read too.
namespace tzhost {

// The components of a colour, whatever its kind.
[[nodiscard]] std::string trueColorText(TzCmEntityColor const& color);
// Nothing for any other text.
[[nodiscard]] std::optional<TzCmEntityColor> readTrueColor(std::string_view text);

}  // namespace tzhost
