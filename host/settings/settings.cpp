#include "host/settings/settings.h"

#include <cerrno>
#include <filesystem>

#include <nlohmann/json.hpp>

#include "host/files/file_bytes.h"
#include "host/files/install_paths.h"
#include "host/settings/variable_json.h"
#include "host/settings/variables.h"
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

}  // namespace

Settings& settings() {
    static Settings inForce;
    return inForce;
}

std::string defaultSettingsFile() {
    std::string const folder = configurationFolder();
    return folder.empty() ? folder : (fs::path(folder) / "settings.json").string();
}

std::optional<std::string> loadSettings(std::string const& path, IfMissing ifMissing) {
    if (path.empty() && ifMissing == IfMissing::useDefaults) return std::nullopt;
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

std::optional<std::string> saveUserVariables(std::string const& path) {
    if (path.empty()) return std::nullopt;
    auto const old = readFile(path);
    Json document = Json::object();
    if (old) {
        // A file that holds no settings may be something else of the user's: it stays as it is.
        if (SettingsResult const read = readSettings(*old); !read.error.empty()) {
            return path + ':' + read.error;
        }
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

}  // namespace tzhost
