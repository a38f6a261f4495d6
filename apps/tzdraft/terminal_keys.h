#pragma once

#include <histedit.h>

namespace tzdraft {

// Binds what the line editor leaves of a terminal's keys: arrows, Home, End and Delete, also with
// Shift, Alt or Ctrl, and the keys that do nothing here. It would take the ends of their sequences,
// such as the "5D" of Ctrl-Left, for typed text.
void bindTerminalKeys(EditLine* line);

}  // namespace tzdraft
