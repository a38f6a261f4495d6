#include "host/files/install_paths.h"

#include <cstdlib>
#include <filesystem>

#include <dlfcn.h>

namespace tzhost {

namespace {

namespace fs = std::filesystem;

constexpr char kOwnFolder[] = "tzdraft";

// The file that this very code was loaded from. A program that was found over $PATH is known by its
// bare name, which is no path: the working folder may hold a file of that name.
fs::path ownFile() {
    static char const here = 0;
    Dl_info info{};
    bool const isPath = dladdr(&here, &info) != 0 && info.dli_fname != nullptr &&
                        fs::path(info.dli_fname).has_parent_path();
    std::error_code none;
    fs::path const file = isPath ? fs::canonical(info.dli_fname, none) : fs::path();
    return file.empty() ? fs::canonical("/proc/self/exe", none) : file;
}

std::string variable(char const* name) {
    char const* const value = std::getenv(name);
    return value ? value : "";
}

}  // namespace

std::string libraryFolder() {
    fs::path const folder = ownFile().parent_path();
    if (folder.empty()) return "/";
    fs::path const beside = folder.parent_path() / "lib";
    std::error_code none;
    bool const isProgram = folder.filename() != "lib" && fs::is_directory(beside, none);
    return (isProgram ? beside : folder).string();
}

std::string configurationFolder() {
    fs::path const given = variable("XDG_CONFIG_HOME");
    if (given.is_absolute()) return (given / kOwnFolder).string();
    fs::path const home = variable("HOME");
    return home.is_absolute() ? (home / ".config" / kOwnFolder).string() : std::string();
}

}  // namespace tzhost
