#pragma once

#include "tz/text/charset.h"
#include "tz/text/string.h"

// One text style of the drawing, as an editing session keeps it.
struct CStyleInfoEntry {
    TzString name;
    TzString fileName;
    double height = 0.0;  // drawing units
    double widthFactor = 1.0;
    TzString typeface;
    bool bold = false;
    bool italic = false;
    Charset charset = kAnsiCharset;
    int pitchAndFamily = 0;
    bool heightIsInitialSize = false;  // the style's own height is 0; `height` is the session's
};
