#include "host/files/file_reader.h"

#include <algorithm>
#include <cerrno>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace tzhost {

namespace {

constexpr std::size_t kLargestFile = std::size_t{1} << 30;

}  // namespace

FileReader::FileReader(std::string const& path)
    : file_(::open(path.c_str(), O_RDONLY | O_CLOEXEC)), hasFailed_(file_ < 0) {}

FileReader::~FileReader() {
    if (file_ > STDIN_FILENO) ::close(file_);
}

std::size_t FileReader::expectedSize() const {
    struct stat status {};
    if (hasFailed_ || ::fstat(file_, &status) != 0 || !S_ISREG(status.st_mode)) return 0;
    return std::min(static_cast<std::size_t>(status.st_size), kLargestFile);
}

std::size_t FileReader::read(char* to, std::size_t size) {
    std::size_t count = 0;
    while (!hasFailed_ && !isAtEnd_ && count < size) {
        ssize_t const got = ::read(file_, to + count, size - count);
        if (got < 0 && errno == EINTR) continue;
        isAtEnd_ = got == 0;  // asked again, a terminal would wait for more
        hasFailed_ = got < 0;
        if (!hasFailed_) count += static_cast<std::size_t>(got);
    }
    total_ += count;
    if (!hasFailed_ && total_ > kLargestFile) {
        errno = EFBIG;
        hasFailed_ = true;
    }
    return hasFailed_ ? 0 : count;
}

}  // namespace tzhost
