#pragma once

#include "tz/text/array.h"

// How the columns of a multi-line text are set. Sizes in drawing units.
struct TextEditorColumns {
    int columnType = 0;       // 0 none, 1 static, 2 dynamic
    bool autoHeight = false;  // dynamic columns as high as they need to be
    int columnCount = 0;
    double columnWidth = 0;
    double columnGutter = 0;
    bool flowReversed = false;  // from right to left
    TzArray<double> heights;    // of each dynamic column without automatic height
};
