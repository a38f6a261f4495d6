#include "host/settings/settings.h"

#include <algorithm>
#include <cerrno>
#include <filesystem>
#include <new>

#include <nlohmann/json.hpp>

#include "host/files/file_bytes.h"
#include "host/files/install_paths.h"
#include "host/settings/variable_json.h"
#include "host/settings/variables.h"
#include "host/text/local_text.h"
#include "host/text/utf8.h"

namespace tzhost {

namespace {

namespace fs = std::filesystem;
using Json = nlohmann::ordered_json;

constexpr int kIndent = 2;

// Puts the user's variables into the document.
void putVariables(Json& document) {
    for (auto const& [name, value] : Variables::instance().kept(KeptIn::user)) {
        std::string const key = toUtf8(name);
        bool const isThere = document.contains("variables") && document["variables"].contains(key);
        bool const isDefault = value == findVariable(name)->defaultValue();
        if (isThere || !isDefault) document["variables"][key] = toJson(value);
    }
}

// The value that the file gives a variable, the last one; null when it gives none.
VariableValue const* valueIn(Settings const& file, std::wstring_view name) {
    auto const at = std::find_if(file.variables.rbegin(), file.variables.rend(),
                                 [&](auto const& each) { return each.first == name; });
    return at == file.variables.rend() ? nullptr : &at->second;
}

// Whether a variable is not as the file has it, or as by default where the file has none.
bool isAnyChanged(Settings const& file) {
    auto const user = Variables::instance().kept(KeptIn::user);
    return std::any_of(user.begin(), user.end(), [&](auto const& each) {
        VariableValue const* const held = valueIn(file, each.first);
        return !(each.second == (held ? *held : findVariable(each.first)->defaultValue()));
    });
}

std::string memoryProblem(std::string const& path, std::string const& failed) {
    return path + ": " + failed + ": " + localText("memory ran short");
}

std::optional<std::string> saveUnguarded(std::string const& path) {
    auto const old = readFile(path);
    Json document = Json::object();
    if (old) {
        // A file that holds no settings may be something else of the user's: it stays as it is.
        SettingsResult const read = readSettings(*old);
        if (!read.error.empty()) return path + ':' + read.error;
        if (!isAnyChanged(read.settings)) return std::nullopt;  // spares a tree of all members
        document = Json::parse(*old);
    }
    Json const before = document;
    putVariables(document);
    if (document == before) return std::nullopt;
    std::error_code none;
    fs::create_directories(fs::path(path).parent_path(), none);
    if (writeFileSafely(path, document.dump(kIndent) + '\n')) return std::nullopt;
    return path + ": " + systemReason();
}

std::optional<std::string> loadUnguarded(std::string const& path, IfMissing ifMissing) {
    auto const bytes = readFile(path);
    if (!bytes) {
        bool const isMissing = errno == ENOENT || errno == ENOTDIR;
        if (isMissing && ifMissing == IfMissing::useDefaults) return std::nullopt;
        return path + ": " + systemReason();
    }
    SettingsResult read = readSettings(*bytes);
    if (!read.error.empty()) return path + ':' + read.error;
    settings() = std::move(read.settings);
    Variables& store = Variables::instance();
    for (auto const& [name, value] : settings().variables)
        (void)store.setKept(name, value);  // checked
    return std::nullopt;
}

}  // namespace

Settings& settings() {
    static Settings inForce;
    return inForce;
}

std::string defaultSettingsFile() {
    std::string const folder = configurationFolder();
    return folder.empty() ? folder : (fs::path(folder) / "settings.json").string();
}

std::optional<std::string> loadSettings(std::string const& path, IfMissing ifMissing) try {
    if (path.empty() && ifMissing == IfMissing::useDefaults) return std::nullopt;
    return loadUnguarded(path, ifMissing);
} catch (std::bad_alloc const&) {
    return memoryProblem(path, localText("cannot be read"));
}

std::optional<std::string> saveUserVariables(std::string const& path) try {
    if (path.empty()) return std::nullopt;
    return saveUnguarded(path);
} catch (std::bad_alloc const&) {
    return memoryProblem(path, localText("cannot be written"));
}

}  // namespace tzhost
