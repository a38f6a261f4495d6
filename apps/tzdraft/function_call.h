#pragma once

#include <string_view>

// Calls of functions that modules define, as they are typed at the idle prompt: (NAME), (NAME #2A)
// with an entity's handle, (NAME "text").
namespace tzdraft {

// Runs the call; what went wrong is one line on the screen.
void callTyped(std::wstring_view line);

}  // namespace tzdraft
