#pragma once

// What lies under a name, told without opening it: opening a pipe waits for its other end, and
// opening a device may set it going. Links are followed.

#include <cerrno>
#include <string>

namespace tzhost {

// What errno says of a device, a pipe or a socket that was to be read as a file. Reading and
// writing files never give this number.
inline constexpr int kNoFile = ENOTSUP;

// Whether a file is there. When not, errno says what is: EISDIR for a folder, kNoFile for a device,
// a pipe or a socket, else why nothing is seen.
[[nodiscard]] bool isFile(std::string const& path);

// Whether a file is there that may not be written to: the system forbids it to this user, or nobody
// has the permission, which counts for the root user too.
[[nodiscard]] bool isReadOnly(std::string const& path);

}  // namespace tzhost
