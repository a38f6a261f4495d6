#include "host/files/safe_file.h"

#include <cerrno>
#include <csignal>
#include <cstdlib>
#include <cstring>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>
#include <utility>

#include "host/text/local_text.h"

namespace tzhost {
namespace {

// A file size limit must give an error, not end the process.
class NoSizeSignal {
public:
    NoSizeSignal() {
        struct sigaction ignore {};
        ignore.sa_handler = SIG_IGN;
        (void)sigaction(SIGXFSZ, &ignore, &before_);  // cannot fail with these arguments
    }
    NoSizeSignal(NoSizeSignal const&) = delete;
    NoSizeSignal& operator=(NoSizeSignal const&) = delete;
    ~NoSizeSignal() { (void)sigaction(SIGXFSZ, &before_, nullptr); }

private:
    struct sigaction before_ {};
};

// The permissions of the old file, else those of a new one.
mode_t permissionsFor(std::filesystem::path const& target) {
    struct stat old {};
    if (stat(target.c_str(), &old) == 0) return old.st_mode & 07777;
    mode_t const mask = umask(0);
    umask(mask);
    return 0666 & ~mask;
}

// Makes the renaming last; folders that cannot be flushed are left to the system.
void flushFolder(std::filesystem::path const& folder) {
    int const handle =
        open(folder.empty() ? "." : folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC);
    if (handle < 0) return;
    (void)fsync(handle);
    (void)close(handle);
}

// A descriptor for the file when the program's own output goes there ("/dev/stdout"), which must
// not be replaced, since others write to it too. -1 when it does not.
int ownOutput(std::filesystem::path const& target) {
    struct stat file {};
    if (stat(target.c_str(), &file) != 0 || !S_ISREG(file.st_mode)) return -1;
    for (int const output : {STDOUT_FILENO, STDERR_FILENO}) {
        struct stat own {};
        if (fstat(output, &own) == 0 && own.st_dev == file.st_dev && own.st_ino == file.st_ino)
            return fcntl(output, F_DUPFD_CLOEXEC, 0);
    }
    return -1;
}

}  // namespace

std::filesystem::path followLinks(std::filesystem::path const& path) {
    namespace fs = std::filesystem;
    constexpr int kMostLinks = 40;
    std::error_code error;
    if (!fs::is_symlink(path, error)) return path;
    if (fs::exists(path, error)) {
        fs::path real = fs::canonical(path, error);
        return error ? path : real;
    }
    fs::path file = path;
    for (int links = 0; fs::is_symlink(file, error); ++links) {
        if (links == kMostLinks) return path;
        file = file.parent_path() / fs::read_symlink(file, error);
    }
    return file;
}

SafeFile::SafeFile(std::filesystem::path const& target)
    : target_(followLinks(target)), file_(ownOutput(target_)) {
    namespace fs = std::filesystem;
    if (isOpen()) return;
    std::error_code error;
    fs::file_status const old = fs::status(target_, error);
    if (fs::is_directory(old)) {
        errno = EISDIR;
        (void)fail();
    } else if (fs::exists(old) && !fs::is_regular_file(old)) {
        file_ = open(target_.c_str(), O_WRONLY | O_CLOEXEC);
        if (file_ < 0) (void)fail();
    } else {
        makeTemporary();
    }
}

void SafeFile::makeTemporary() {
    temporary_ = (target_.parent_path() / ("." + target_.filename().string() + ".XXXXXX")).string();
    file_ = mkostemp(temporary_.data(), O_CLOEXEC);
    if (file_ < 0) {
        temporary_.clear();
        (void)fail();
    } else if (fchmod(file_, permissionsFor(target_)) != 0) {
        (void)fail();
    }
}

SafeFile::~SafeFile() {
    if (file_ >= 0) (void)close(file_);  // nothing is lost: the file goes away
    if (!temporary_.empty()) (void)unlink(temporary_.c_str());
}

bool SafeFile::fail() {
    if (problem_ == 0) problem_ = errno;
    return false;
}

std::string SafeFile::reason() const {
    return localText(std::strerror(problem_));
}

bool SafeFile::write(std::string_view bytes) {
    NoSizeSignal const quiet;
    while (problem_ == 0 && !bytes.empty()) {
        ssize_t const written = ::write(file_, bytes.data(), bytes.size());
        if (written > 0) {
            bytes.remove_prefix(static_cast<std::size_t>(written));
        } else if (errno != EINTR) {
            return fail();
        }
    }
    return problem_ == 0;
}

bool SafeFile::commit() {
    if (problem_ != 0) return false;
    bool const isDevice = temporary_.empty();
    if (!isDevice && fsync(file_) != 0) return fail();
    int const handle = std::exchange(file_, -1);
    if (close(handle) != 0) return fail();
    if (isDevice) return true;
    if (rename(temporary_.c_str(), target_.c_str()) != 0) return fail();
    temporary_.clear();
    flushFolder(target_.parent_path());
    return true;
}

}  // namespace tzhost
