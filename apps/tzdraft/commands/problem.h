#pragma once

#include "host/command_line/command_line.h"
#include "tz/text/string.h"

namespace tzdraft {

// A line about what a command was told wrongly. `format` and `values` are those of
// TzString::formatted.
template <class... Values>
void tellProblem(wchar_t const* format, Values... values) {
    tzhost::commandLine().sayProblem(TzString::formatted(format, values...).str());
}

}  // namespace tzdraft
