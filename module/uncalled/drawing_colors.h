#pragma once

// The colours, 0x00BBGGRR, that "as the layer" and "as the block" mean for a text not yet drawn.
// Nothing calls these yet: they are for the session of the dialog editor.

// Of the layer in force; white when it cannot be opened.
[[nodiscard]] unsigned int GetCurrentDrawingByLayerColor();
// White.
[[nodiscard]] unsigned int GetCurrentDrawingByBlockColor();
