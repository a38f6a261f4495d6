#pragma once

namespace tzdraft {

// The group of the command stack that they stand in.
inline constexpr wchar_t kHostCommandGroup[] = L"TZDRAFT";

// Puts the program's own commands, beside those of modules, on the host's command stack, with their
// help.
void registerHostCommands();

}  // namespace tzdraft
