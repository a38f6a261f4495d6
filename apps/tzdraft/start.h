#pragma once

#include <filesystem>
#include <string>

#include "apps/tzdraft/draft_options.h"

// What the host needs to know before a drawing opens.
namespace tzdraft {

// The module to load: the one that was named, else that beside the host's library.
[[nodiscard]] std::filesystem::path modulePath(Options const& options);

// Whether the module's resource library is there and whole.
[[nodiscard]] bool hasModuleResources();

// The settings file of this run: the one that was named, else the user's.
[[nodiscard]] std::string settingsFile(Options const& options);

// Settings that cannot be used are left as they are, and nothing is saved into them.
enum class SettingsState { usable, unusable };

// Puts the settings, the variables of this run, the language, the resources, the font map and the
// editors in place, all else at its start. False and one line in `error` for what the options name
// and cannot be used.
[[nodiscard]] bool
configureHost(Options const& options, SettingsState& settings, std::string& error);

}  // namespace tzdraft
