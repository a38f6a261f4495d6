#pragma once

#include "tz/db/object_id.h"

// The colours, 0x00BBGGRR, that "as the layer" and "as the block" mean for a text.

// The colour of that layer; white when the layer cannot be opened.
[[nodiscard]] unsigned int layerColor(TzDbObjectId layer);
// The colour of the layer in force; white when the layer cannot be opened.
[[nodiscard]] unsigned int GetCurrentDrawingByLayerColor();
// Always white.
[[nodiscard]] unsigned int GetCurrentDrawingByBlockColor();
