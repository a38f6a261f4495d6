#include "host/files/part_file.h"

#include <cerrno>
#include <cstdlib>
#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>

namespace tzhost {
namespace {

namespace fs = std::filesystem;

constexpr std::string_view kMark = ".tz-part-";
constexpr std::string_view kPattern = "XXXXXX";
constexpr std::size_t kLongestName = 255;  // of a file in its folder

// The name up to the random part. A name that would get too long is cut.
std::string prefixOf(fs::path const& target) {
    std::size_t const room = kLongestName - 1 - kMark.size() - kPattern.size();
    return '.' + target.filename().string().substr(0, room) + std::string(kMark);
}

bool isLocked(int file) {
    return flock(file, LOCK_EX | LOCK_NB) != 0 && errno == EWOULDBLOCK;
}

// A save that looks for left files may have taken the new file for one before it was locked.
bool isStillThere(int file) {
    struct stat status {};
    return fstat(file, &status) == 0 && status.st_nlink > 0;
}

// Where locks do not work nothing is removed.
void removeIfLeft(fs::path const& file) {
    int const handle = open(file.c_str(), O_RDWR | O_NOFOLLOW | O_NONBLOCK | O_CLOEXEC);
    if (handle < 0) return;
    if (flock(handle, LOCK_EX | LOCK_NB) == 0) (void)unlink(file.c_str());  // a try is enough
    (void)close(handle);
}

}  // namespace

int makePartFile(fs::path const& target, std::string& name) {
    std::string const pattern =
        (target.parent_path() / (prefixOf(target) + std::string(kPattern))).string();
    for (;;) {
        name = pattern;
        int const file = mkostemp(name.data(), O_CLOEXEC);
        if (file < 0) name.clear();
        if (file < 0 || (!isLocked(file) && isStillThere(file))) return file;
        (void)close(file);  // the other save removes it
    }
}

void removeLeftPartFiles(fs::path const& target) {
    std::string const prefix = prefixOf(target);
    std::size_t const length = prefix.size() + kPattern.size();
    fs::path const folder = target.has_parent_path() ? target.parent_path() : ".";
    std::error_code problem;  // a folder that cannot be read keeps what is left in it
    for (fs::directory_iterator each(folder, problem), end; !problem && each != end;
         each.increment(problem)) {
        std::string const name = each->path().filename().string();
        if (name.size() == length && name.starts_with(prefix)) removeIfLeft(each->path());
    }
}

}  // namespace tzhost
