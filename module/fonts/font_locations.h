#pragma once

#include "tz/pal/registry.h"
#include "tz/text/std_str.h"

// The registry keys that list fonts, of the system and of the product. Each object is made on first
// use; looking a face up finds something only while they are open.
[[nodiscard]] CTwUiRegistryAccess& regLocation();
[[nodiscard]] CTwUiRegistryAccess& regLocationAlt();

// The file of a face in a font collection: such a face stands under a name that lists several
// faces, joined by " & ". Empty when there is none.
[[nodiscard]] CStdStrW SearchForTTCFile(CStdStrW name, CTwUiRegistryAccess& reg);
