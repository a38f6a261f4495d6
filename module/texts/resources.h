#pragma once

#include "tz/text/string.h"

class TzRxResourceInstance;

// The module's texts: every prompt, keyword and message by its id.
//
//   tzutPrintf(loadResourceString(163));
//
// Texts that are shown go through gStringTable of module/texts/string_table.h, which also expands
// variables in them.

// The resource library "TzmtedRes.dll", read on first use and kept until the module goes.
[[nodiscard]] TzRxResourceInstance const& getMteResourceInstance();
// The text under an id; empty when there is none.
[[nodiscard]] TzString loadResourceString(int id);
// The name of a warning that the user may silence, made of its number.
[[nodiscard]] TzString getWarningId(int number);
