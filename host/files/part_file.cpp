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
constexpr std::string_view kPlaces = "0123";
constexpr std::string_view kPattern = "XXXXXX";  // when all places are taken
constexpr std::size_t kLongestName = 255;        // of a file in its folder

// The name up to the place. A name that would get too long is cut.
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
void removeIfLeft(std::string const& file) {
    int const handle = open(file.c_str(), O_RDWR | O_NOFOLLOW | O_NONBLOCK | O_CLOEXEC);
    if (handle < 0) return;
    if (flock(handle, LOCK_EX | LOCK_NB) == 0) (void)unlink(file.c_str());  // a try is enough
    (void)close(handle);
}

// Whether the new file is this save's; else another one removes it.
bool isOwn(int file) {
    return !isLocked(file) && isStillThere(file);
}

// With a name that nobody has. The descriptor, or -1 and errno.
int makeBesideAll(std::string const& prefix, std::string& name) {
    for (;;) {
        name = prefix + std::string(kPattern);
        int const file = mkostemp(name.data(), O_CLOEXEC);
        if (file < 0 || isOwn(file)) return file;
        (void)close(file);
    }
}

// The descriptor of a new file, or -1 and errno.
int makeNew(std::string const& file) {
    return open(file.c_str(), O_RDWR | O_CREAT | O_EXCL | O_NOFOLLOW | O_CLOEXEC, 0600);
}

// In the place of one that was left. The descriptor, or -1 and errno: EEXIST when a save has it.
int makeAt(std::string const& place) {
    int file = makeNew(place);
    if (file < 0 && errno == EEXIST) {
        removeIfLeft(place);
        file = makeNew(place);
    }
    if (file < 0 || isOwn(file)) return file;
    (void)close(file);
    errno = EEXIST;
    return -1;
}

// At the first free place; nothing stays behind at the others. The descriptor, or -1 and errno:
// EEXIST when all are taken.
int makeAtAPlace(std::string const& prefix, std::string& name) {
    int file = -1;
    for (char const place : kPlaces) {
        if (file >= 0) {
            removeIfLeft(prefix + place);
            continue;
        }
        name = prefix + place;
        file = makeAt(name);
        if (file < 0 && errno != EEXIST) return file;
    }
    return file;
}

}  // namespace

int makePartFile(fs::path const& target, std::string& name) {
    std::string const prefix = (target.parent_path() / prefixOf(target)).string();
    int file = makeAtAPlace(prefix, name);
    if (file < 0 && errno == EEXIST) file = makeBesideAll(prefix, name);
    if (file < 0) name.clear();
    return file;
}

}  // namespace tzhost
