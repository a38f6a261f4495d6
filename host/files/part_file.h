#pragma once

// The unfinished file that a save writes beside the file which it will replace. Its name is that of
// the file with a dot before and ".tz-part-XXXXXX" after it. The save that writes it holds a lock
// on it, by which others tell it from one that a killed save left.

#include <filesystem>
#include <string>

namespace tzhost {

// Makes one, locked, and puts its path into `name`. The descriptor, or -1 and errno.
[[nodiscard]] int makePartFile(std::filesystem::path const& target, std::string& name);

// Removes those of the same target that no save writes any more.
void removeLeftPartFiles(std::filesystem::path const& target);

}  // namespace tzhost
