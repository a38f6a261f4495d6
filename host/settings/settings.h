#pragma once

// What the user has set, from one JSON file:
//
//   {"variables": {"MTEXTED": "Internal"},              system variables of the user's settings
//    "product": {"MTEXT.IPE": {"MinPixelSize": 6}},     whole numbers of 32 bits
//    "registry": {"HKEY_CURRENT_USER\\KEY": {"NAME": 5}},   numbers (type 4) and texts (type 1)
//    "productKey": "", "denied": ["FIELD"], "fabric": false, "inPlaceEditors": [],
//    "rtfEditor": "", "textEditor": ""}
//
// Every member may be left out. Any other member is an error, told with its line, and then nothing
// of the file counts.

#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <variant>
#include <vector>

#include "host/settings/variable_value.h"

namespace tzhost {

using RegistryValue = std::variant<std::uint32_t, std::wstring>;

// Names of products, of their values and of registry keys are in lower case. Names of registry
// values are as written.
struct Settings {
    std::vector<std::pair<std::wstring, VariableValue>> variables;
    std::map<std::wstring, std::map<std::wstring, std::uint32_t>> product;
    std::map<std::wstring, std::vector<std::pair<std::wstring, RegistryValue>>> registry;
    std::wstring productKey;
    std::vector<std::wstring> denied;
    bool fabric = false;
    std::vector<std::wstring> inPlaceEditors;
    std::wstring rtfEditor;
    std::wstring textEditor;
};

// The settings in force: empty ones until some are loaded.
[[nodiscard]] Settings& settings();

// Reads settings. What is wrong with them stands in `error`, as "line: member: what".
struct SettingsResult {
    Settings settings;
    std::string error;
};
[[nodiscard]] SettingsResult readSettings(std::string_view bytes);

enum class IfMissing { useDefaults, fail };

// Loads the file into settings(), and its variables beneath their overrides into the store; an
// empty path is a missing file. The line to show when it cannot be read or is wrong; then nothing
// has changed.
[[nodiscard]] std::optional<std::string> loadSettings(std::string const& path, IfMissing ifMissing);

// Writes the user's variables back into the file, with everything else in it as it was. A variable
// that has its default and is not in the file stays out of it, and a file that would not change is
// not touched. With an empty path nothing is written. The line to show when it cannot be written.
[[nodiscard]] std::optional<std::string> saveUserVariables(std::string const& path);

// The file that is used when none is named. Empty when the user has no folder for it.
[[nodiscard]] std::string defaultSettingsFile();

}  // namespace tzhost
