#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "tz/gi/color.h"

// Colours as a drafter types and reads them: an index or "#RRGGBB".
namespace tzdraft {

// The colour of a layer, which follows neither block nor layer: an index goes from 1 to 255.
[[nodiscard]] std::optional<TzCmColor> readColor(std::wstring_view text);
[[nodiscard]] std::wstring writeColor(TzCmColor const& color);

}  // namespace tzdraft
