#pragma once

// Whole files as bytes.

#include <optional>
#include <string>
#include <string_view>

namespace tzhost {

// Nothing when the file cannot be opened or read to its end; errno then says why. Folders, devices
// and pipes are refused at once, and so is a file over 1 GiB.
[[nodiscard]] std::optional<std::string> readFile(std::string const& path);

// Writes the file as SafeFile does (safe_file.h), whole or not at all. False when that fails: the
// old file is as it was, and errno says why.
[[nodiscard]] bool writeFileSafely(std::string const& path, std::string_view bytes);

// What errno says about the last failed call, in words.
[[nodiscard]] std::string systemReason();

}  // namespace tzhost
