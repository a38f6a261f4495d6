#pragma once

// The unfinished file that a save writes beside the file which it will replace. Its name is that of
// the file with a dot before and ".tz-part-0" after it, or a number up to 3 while other saves of
// the same file go on, so that one that a killed save left is found without a look through the
// folder. The save that writes it holds a lock on it, by which others tell it from one that was
// left.

#include <filesystem>
#include <string>

namespace tzhost {

// Makes one, locked, and puts its path into `name`; those of the same target that no save writes
// any more are removed. The descriptor, or -1 and errno.
[[nodiscard]] int makePartFile(std::filesystem::path const& target, std::string& name);

}  // namespace tzhost
