#pragma once

#include <span>

namespace tzdraft {

// The group of the command stack that they stand in.
inline constexpr wchar_t kHostCommandGroup[] = L"TZDRAFT";

// A command of the program itself, beside those of modules.
struct HostCommand {
    wchar_t const* name;  // the global one; its local text is the local one
    void (*body)();
    int flags;            // as the command stack takes them
    wchar_t const* help;  // one sentence, or several apart by line feeds
};

// All of them, by name.
[[nodiscard]] std::span<HostCommand const> hostCommands();

// Puts them on the host's command stack, with their help.
void registerHostCommands();

}  // namespace tzdraft
