#pragma once

#include "apps/tzdraft/program_texts.h"
#include "host/command_line/command_line.h"
#include "tz/text/string.h"

namespace tzdraft {

// A line about what a command was told wrongly. `format` and `values` are those of
// TzString::formatted.
template <class... Values>
void tellProblem(wchar_t const* format, Values... values) {
    tzhost::commandLine().sayProblem(TzString::formatted(format, values...).str());
}

// About a name that no record of a table can have; `format` takes it.
inline void tellNoName(wchar_t const* format, TzString const& name) {
    tellProblem(
        L"%ls%ls", TzString::formatted(format, name.kwszPtr()).kwszPtr(),
        localText(
            L" A name has up to 255 letters, none of < > / \\ \" : ; = ` ? * , | and no blank at its ends."));
}

}  // namespace tzdraft
