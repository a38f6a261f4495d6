#include "host/files/real_paths.h"

#include <filesystem>

#include "host/files/safe_file.h"

namespace tzhost {

namespace fs = std::filesystem;

// Empty for a folder that is not there or cannot be looked at.
std::string const& RealPaths::realFolder(std::string const& folder) {
    if (auto const at = folders_.find(folder); at != folders_.end()) return at->second;
    std::error_code unreadable;
    fs::path const real = fs::canonical(folder.empty() ? "." : folder, unreadable);
    static std::string const kNone;  // the folder may be made yet
    return unreadable ? kNone : folders_.emplace(folder, real.string()).first->second;
}

// The file itself, links followed, from the root even when it is not there.
std::string RealPaths::of(std::string const& file) {
    std::error_code unreadable;  // will be named when it is read
    fs::path const path(file);
    std::string const name = path.filename().string();
    bool const isPlain = !name.empty() && name != "." && name != "..";
    if (isPlain && !fs::is_symlink(path, unreadable)) {
        std::string const& folder = realFolder(path.parent_path().string());
        if (!folder.empty()) return (fs::path(folder) / name).string();
    }
    fs::path const named = fs::absolute(path, unreadable);
    fs::path const real = fs::weakly_canonical(followLinks(named), unreadable);
    return unreadable ? named.string() : real.string();
}

}  // namespace tzhost
