#pragma once

// Whole files as bytes.

#include <optional>
#include <string>
#include <string_view>

namespace tzhost {

// Nothing when the file cannot be opened or read to its end; folders are no files. A file over 1
// GiB is not read.
[[nodiscard]] std::optional<std::string> readFile(std::string const& path);

// Writes beside the file, flushes to the disk and renames over it, so that a crash leaves the old
// file or the new one. A symbolic link is followed, and an old file's permissions stay. False, with
// the old file as it was, when any of it fails.
[[nodiscard]] bool writeFileSafely(std::string const& path, std::string_view bytes);

// What the system says about the last failed call, in words.
[[nodiscard]] std::string systemReason();

}  // namespace tzhost
