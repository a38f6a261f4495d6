#pragma once

#include "tz/db/object_id.h"

// The colours, 0x00BBGGRR, that "as the layer" and "as the block" mean for a text.

// Of that layer; white when it cannot be opened.
[[nodiscard]] unsigned int layerColor(TzDbObjectId layer);
// Of the layer in force; white when it cannot be opened.
[[nodiscard]] unsigned int GetCurrentDrawingByLayerColor();
// White.
[[nodiscard]] unsigned int GetCurrentDrawingByBlockColor();
