#pragma once

#include <string>

#include "tz/text/string.h"

// The texts of the help topics that commands and functions registered.
//
// A module registers topics by name. Their texts stand in a file beside the module, with its name
// and the ending ".help": UTF-8, each topic a line "[NAME]" and the lines up to the next one, the
// first of which says in one sentence what the command does. The program's own commands register
// their texts themselves.
namespace tzdraft {

// The text about a command or a function, with line feeds between its lines. One that registered no
// topic is looked for under its own name; a registered topic that no file tells about is its own
// text; else the text is empty.
[[nodiscard]] std::wstring helpFor(TzString const& name);

}  // namespace tzdraft
