#include "host/files/file_kind.h"

#include <sys/stat.h>
#include <unistd.h>

namespace tzhost {

bool isFile(std::string const& path) {
    struct stat status {};
    if (stat(path.c_str(), &status) != 0) return false;
    if (!S_ISREG(status.st_mode)) errno = S_ISDIR(status.st_mode) ? EISDIR : kNoFile;
    return S_ISREG(status.st_mode);
}

bool isReadOnly(std::string const& path) {
    constexpr mode_t kAnybodyWrites = 0222;
    struct stat status {};
    if (stat(path.c_str(), &status) != 0 || !S_ISREG(status.st_mode)) return false;
    return (status.st_mode & kAnybodyWrites) == 0 || access(path.c_str(), W_OK) != 0;
}

}  // namespace tzhost
