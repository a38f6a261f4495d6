#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "tz/gi/color.h"

// Colours as a drafter types and reads them: an index from 0 (by block) to 256 (by layer), or
// "#RRGGBB".
namespace tzdraft {

[[nodiscard]] std::optional<TzCmColor> readColor(std::wstring_view text);
[[nodiscard]] std::wstring writeColor(TzCmColor const& color);

}  // namespace tzdraft
