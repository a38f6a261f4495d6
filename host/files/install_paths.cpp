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

// Of an installation: seen from the library, then from a program; of a build: from a program.
constexpr char const* kWays[] = {"tz", TZ_FROM_PROGRAM_TO_BESIDE, "../lib"};

std::string findLibraryFolder() {
    fs::path const folder = ownFile().parent_path();
    if (folder.empty()) return "/";
    for (char const* way : kWays) {
        fs::path const beside = (folder / way).lexically_normal();
        std::error_code none;
        if (fs::is_directory(beside, none)) return beside.string();
    }
    return folder.string();
}

std::string variable(char const* name) {
    char const* const value = std::getenv(name);
    return value ? value : "";
}

}  // namespace

std::string libraryFolder() {
    // Where it was at the first question: a session outlives the removal of what it runs from.
    static std::string const folder = findLibraryFolder();
    return folder;
}

std::string configurationFolder() {
    fs::path const given = variable("XDG_CONFIG_HOME");
    if (given.is_absolute()) return (given / kOwnFolder).string();
    fs::path const home = variable("HOME");
    return home.is_absolute() ? (home / ".config" / kOwnFolder).string() : std::string();
}

}  // namespace tzhost
