#pragma once

#include "host/command_line/answer_source.h"

// What completion offers where a command asks for a name. Empty unless a person answers.
namespace tzdraft {

[[nodiscard]] tzhost::Offer offerLayers();
[[nodiscard]] tzhost::Offer offerStyles();
[[nodiscard]] tzhost::Offer offerBlocks();
[[nodiscard]] tzhost::Offer offerVariables();
[[nodiscard]] tzhost::Offer offerCommands();

// The names of all commands: the local one, and "_" with the global one.
[[nodiscard]] std::vector<std::wstring> commandNames();
// " Near it is NAME.", of the command that was likely meant; empty when none was.
[[nodiscard]] std::wstring nearCommand(std::wstring_view typed);

}  // namespace tzdraft
