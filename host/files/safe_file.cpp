#include "host/files/safe_file.h"

#include <cerrno>
#include <csignal>
#include <cstdlib>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>
#include <utility>

#include "host/files/file_kind.h"
#include "host/files/part_file.h"
#include "host/text/local_text.h"
#include "host/text/system_words.h"

namespace tzhost {
namespace {

// Makes a write beyond the limit on file sizes fail instead of ending the process by a signal.
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

// The permissions of a new file.
mode_t newPermissions() {
    mode_t const mask = umask(0);
    umask(mask);
    return 0666 & ~mask;
}

// A descriptor for the file when the program's own output goes there ("/dev/stdout"), else -1. Such
// a file must not be replaced, since others write to it too.
int ownOutput(struct stat const& file) {
    if (!S_ISREG(file.st_mode)) return -1;
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

void flushFolder(std::filesystem::path const& folder) {
    int const handle =
        open(folder.empty() ? "." : folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC);
    if (handle < 0) return;
    (void)fsync(handle);
    (void)close(handle);
}

SafeFile::SafeFile(std::filesystem::path const& target, IfReadOnly ifReadOnly) : target_(target) {
    struct stat old {};
    bool isThere = lstat(target_.c_str(), &old) == 0;
    if (isThere && S_ISLNK(old.st_mode)) {
        target_ = followLinks(target);
        isThere = stat(target_.c_str(), &old) == 0;
    }
    int const problem = errno;
    if (isThere) file_ = ownOutput(old);
    if (isOpen()) return;
    if (!isThere && problem != ENOENT) {
        (void)fail(problem);  // a ring of links, a name that is too long, a folder that is none
    } else if (isThere && S_ISDIR(old.st_mode)) {
        (void)fail(EISDIR);
    } else if (isThere && !S_ISREG(old.st_mode)) {
        file_ = open(target_.c_str(), O_WRONLY | O_CLOEXEC);
        if (file_ < 0) (void)fail();
    } else if (isThere && ifReadOnly == IfReadOnly::refuse && isReadOnly(target_.string())) {
        words_ = forLocalText("it is read-only");
        (void)fail(EACCES);
    } else {
        makePart(isThere ? &old : nullptr);
    }
}

void SafeFile::makePart(struct stat const* old) {
    file_ = makePartFile(target_, part_);
    if (file_ < 0) {
        (void)fail();
        return;
    }
    struct stat made {};
    bool const isOwned = !old || (fstat(file_, &made) == 0 && made.st_uid == old->st_uid &&
                                  made.st_gid == old->st_gid);
    if (!isOwned && fchown(file_, old->st_uid, old->st_gid) != 0) {
        words_ = forLocalText("its owner and group cannot be kept");
        (void)fail();
    } else if (fchmod(file_, old ? old->st_mode & 07777 : newPermissions()) != 0) {
        (void)fail();
    }
}

SafeFile::~SafeFile() {
    if (!part_.empty()) (void)unlink(part_.c_str());
    if (file_ >= 0) (void)close(file_);  // last, since it is locked up to here
}

bool SafeFile::fail(int problem) {
    if (problem_ == 0) problem_ = problem;
    return false;
}

bool SafeFile::fail() {
    return fail(errno);
}

std::string SafeFile::reason() const {
    return words_ ? localText(words_) : systemWords(problem_);
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
    bool const isPart = !part_.empty();
    if (!flush() || !takePlace()) return false;
    if (isPart) flushFolder(folder());
    return true;
}

bool SafeFile::flush() {
    return problem_ == 0 && (part_.empty() || fsync(file_) == 0 || fail());
}

bool SafeFile::takePlace() {
    if (problem_ != 0) return false;
    bool const isPart = !part_.empty();
    if (isPart && rename(part_.c_str(), target_.c_str()) != 0) return fail();
    part_.clear();
    bool const isClosed = close(std::exchange(file_, -1)) == 0;
    return isClosed || isPart || fail();  // a part was flushed, so that nothing is left to fail
}

}  // namespace tzhost
