#pragma once

#include <filesystem>
#include <string_view>

namespace tzdraft {

// The file that a person means by a name: "~/plan.json" is one in the folder of $HOME, if that is
// absolute. A script's name is taken as it stands.
[[nodiscard]] std::filesystem::path fileTyped(std::wstring_view name);

}  // namespace tzdraft
