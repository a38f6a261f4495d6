#pragma once

// One conversion, set up by the options as an editing session is by its text style.

#include <string>

#include "apps/tzconvert/options.h"

namespace tzconvert {

// What a conversion found; sizes in half-points of the document. Of markup that is written, what
// the options said.
struct Results {
    unsigned int incidents = 0;
    double tracking = 1.0;
    double widthFactor = 1.0;
    double oblique = 0.0;
    int baseAlignment = 0;
    int minFontSize = 0;
    int maxFontSize = 0;
    int initialFontSize = 0;
    int currentFontSize = 0;
    bool stacksSeen = false;
};

struct Converted {
    std::wstring text;
    Results results;
};

// Gives `text` up as soon as it is read.
[[nodiscard]] Converted convert(Options const& options, std::wstring text);

}  // namespace tzconvert
