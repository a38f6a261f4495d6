#include "host/files/install_paths.h"

#include <cstdlib>
#include <filesystem>

#include <dlfcn.h>

namespace tzhost {

namespace {

namespace fs = std::filesystem;

// The file that this very code was loaded from.
fs::path ownFile() {
    static char const here = 0;
    Dl_info info{};
    std::error_code none;
    if (dladdr(&here, &info) == 0 || info.dli_fname == nullptr) return {};
    fs::path const file = fs::canonical(info.dli_fname, none);
    // A program may be known by a bare name only.
    return none ? fs::canonical("/proc/self/exe", none) : file;
}

std::string variable(char const* name) {
    char const* const value = std::getenv(name);
    return value ? value : "";
}

}  // namespace

std::string libraryFolder() {
    fs::path const folder = ownFile().parent_path();
    fs::path const beside = folder.parent_path() / "lib";
    std::error_code none;
    bool const isProgram = folder.filename() != "lib" && fs::is_directory(beside, none);
    return (isProgram ? beside : folder).string();
}

std::string configurationFolder() {
    std::string const given = variable("XDG_CONFIG_HOME");
    fs::path const root = given.empty() ? fs::path(variable("HOME")) / ".config" : fs::path(given);
    return (root / "tzdraft").string();
}

}  // namespace tzhost
