#pragma once

#include "module/align/spacing/text_direction.h"
#include "tz/text/string.h"

// Keywords and descriptions of the justifications and the spacing options. The descriptions are
// read once and stay those of the language at that time.

// Empty for a number that is no justification.
[[nodiscard]] TzString descriptionOf(tagTextDirection direction);
// From a description or a global keyword; any other text reads as TL.
[[nodiscard]] tagTextDirection directionOf(TzString const& answer);

// From the name of an option; empty for an unknown one.
[[nodiscard]] TzString descriptionOfOption(TzString const& name);
// From a global keyword; empty for an unknown one.
[[nodiscard]] TzString optionNameOf(TzString const& keyword);
