#pragma once

// One conversion, set up by the options as an editing session is by its text style.

#include <string>

#include "apps/tzconvert/font_tables.h"
#include "apps/tzconvert/options.h"
#include "module/markup/session/conversion_session.h"

namespace tzconvert {

struct Converted {
    std::wstring text;
    // Of markup that is written: what the options said, and whether stacks were seen.
    MarkupFindings found;
    // Of RTF that was read.
    RtfLosses losses;
};

// Gives `text` up as soon as it is read. The result is that of a new session: the font tables hold
// the map alone, and the scales know no sizes yet.
[[nodiscard]] Converted convert(Options const& options, FontTables& fonts, std::wstring text);

}  // namespace tzconvert
