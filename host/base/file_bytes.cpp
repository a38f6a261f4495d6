#include "host/base/file_bytes.h"

#include <cerrno>
#include <cstring>
#include <filesystem>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include "host/base/file_reader.h"
#include "host/base/local_text.h"

namespace tzhost {

namespace {

// An open file, closed on every way out.
class Descriptor {
public:
    explicit Descriptor(int number) : number_(number) {}
    ~Descriptor() {
        if (number_ >= 0) ::close(number_);
    }
    Descriptor(Descriptor const&) = delete;
    Descriptor& operator=(Descriptor const&) = delete;

    [[nodiscard]] int number() const { return number_; }
    [[nodiscard]] bool isOpen() const { return number_ >= 0; }

private:
    int number_;
};

bool writeAll(int file, std::string_view bytes) {
    while (!bytes.empty()) {
        ssize_t const written = ::write(file, bytes.data(), bytes.size());
        if (written < 0 && errno == EINTR) continue;
        if (written <= 0) return false;
        bytes.remove_prefix(static_cast<std::size_t>(written));
    }
    return true;
}

// The file that a path leads to, through symbolic links; the path itself when there is none yet.
std::string resolved(std::string const& path) {
    std::error_code none;
    auto const real = std::filesystem::canonical(path, none);
    return none ? path : real.string();
}

bool writeTemporary(int file, std::string const& target, std::string_view bytes) {
    struct stat status {};
    mode_t const mask = ::umask(0);
    ::umask(mask);
    mode_t const mode =
        ::stat(target.c_str(), &status) == 0 ? status.st_mode & 07777 : 0666 & ~mask;
    return writeAll(file, bytes) && ::fchmod(file, mode) == 0 && ::fsync(file) == 0;
}

// Lets the renaming survive a power failure too. A file system that cannot do this is no error.
void flushFolder(std::string const& target) {
    std::string const folder = std::filesystem::path(target).parent_path().string();
    Descriptor const open(::open(folder.empty() ? "." : folder.c_str(), O_RDONLY | O_CLOEXEC));
    if (open.isOpen()) (void)::fsync(open.number());
}

}  // namespace

std::optional<std::string> readFile(std::string const& path) {
    constexpr std::size_t kPiece = 1 << 16;
    FileReader reader(path);
    std::string bytes;
    for (std::size_t room = reader.expectedSize() + 1;; room = kPiece) {
        std::size_t const before = bytes.size();
        bytes.resize(before + room);
        bytes.resize(before + reader.read(bytes.data() + before, room));
        if (reader.hasFailed()) return std::nullopt;
        if (bytes.size() < before + room) return bytes;
    }
}

bool writeFileSafely(std::string const& path, std::string_view bytes) {
    std::string const target = resolved(path);
    std::string temporary = target + ".XXXXXX";
    Descriptor const file(::mkostemp(temporary.data(), O_CLOEXEC));
    if (!file.isOpen()) return false;
    if (writeTemporary(file.number(), target, bytes) &&
        ::rename(temporary.c_str(), target.c_str()) == 0) {
        flushFolder(target);
        return true;
    }
    int const reason = errno;
    ::unlink(temporary.c_str());
    errno = reason;
    return false;
}

std::string systemReason() {
    return localText(std::strerror(errno));
}

}  // namespace tzhost
