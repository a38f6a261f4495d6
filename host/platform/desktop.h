#pragma once

// The screen, in numbers: three rectangles in pixels from the desktop's top left corner.

#include "tz/pal/windows_calls.h"

namespace tzhost {

struct Screen {
    RECT desktop{0, 0, 1920, 1080};
    RECT application{0, 0, 1920, 1080};
    RECT drawingArea{160, 90, 1760, 990};
};

// The rectangles in force; whoever has a real screen writes its own here.
[[nodiscard]] Screen& screen();

}  // namespace tzhost
