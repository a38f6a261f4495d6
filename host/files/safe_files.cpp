#include "host/files/safe_files.h"

#include <algorithm>
#include <array>
#include <filesystem>
#include <set>
#include <utility>

#include <linux/magic.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/vfs.h>
#include <unistd.h>

namespace tzhost {
namespace {

using namespace std::chrono_literals;

constexpr std::size_t kMostFiles = 256;
constexpr std::size_t kPartOfDescriptors = 4;
constexpr auto kLongest = 200ms;

std::size_t mostFiles() {
    rlimit limit{};
    if (getrlimit(RLIMIT_NOFILE, &limit) != 0) return 1;
    return std::clamp(static_cast<std::size_t>(limit.rlim_cur) / kPartOfDescriptors, std::size_t{1},
                      kMostFiles);
}

// File systems whose syncfs waits until all is on the disk; with others, those of networks and of
// user programs, it may wait for less than fsync does.
bool syncsAsAWhole(int file) {
    constexpr std::array<unsigned long, 6> kKinds = {
        EXT4_SUPER_MAGIC, XFS_SUPER_MAGIC,       BTRFS_SUPER_MAGIC,
        F2FS_SUPER_MAGIC, OVERLAYFS_SUPER_MAGIC, TMPFS_MAGIC,
    };
    struct statfs status {};
    if (fstatfs(file, &status) != 0) return false;
    auto const kind = static_cast<unsigned long>(status.f_type);
    return std::find(kKinds.begin(), kKinds.end(), kind) != kKinds.end();
}

// The file systems that were flushed as a whole.
class FlushedSystems {
public:
    // Whether the file is on the disk, after a flush of its file system if that serves.
    bool hold(int file) {
        struct stat status {};
        if (file < 0 || fstat(file, &status) != 0) return false;
        if (flushed_.count(status.st_dev) != 0) return true;
        if (!syncsAsAWhole(file) || syncfs(file) != 0) return false;
        flushed_.insert(status.st_dev);
        return true;
    }

private:
    std::set<dev_t> flushed_;
};

}  // namespace

SafeFiles::SafeFiles() : most_(mostFiles()) {
    sigemptyset(&before_);
}

SafeFiles::~SafeFiles() {
    files_.clear();
    releaseSignals();
}

void SafeFiles::holdSignals() {
    if (holdsSignals_) return;
    sigset_t ends;
    sigemptyset(&ends);
    for (int const signal : {SIGINT, SIGTERM, SIGHUP, SIGPIPE})
        sigaddset(&ends, signal);
    holdsSignals_ = sigprocmask(SIG_BLOCK, &ends, &before_) == 0;
}

void SafeFiles::releaseSignals() {
    if (std::exchange(holdsSignals_, false)) (void)sigprocmask(SIG_SETMASK, &before_, nullptr);
}

std::string SafeFiles::add(std::string const& path, std::string_view bytes) {
    if (files_.empty()) first_ = std::chrono::steady_clock::now();
    holdSignals();
    SafeFile& file = files_.emplace_back(path);
    if (file.isOpen() && file.write(bytes)) return {};
    std::string reason = file.reason();
    files_.pop_back();
    if (files_.empty()) releaseSignals();
    return reason;
}

bool SafeFiles::areDue() const {
    return files_.size() >= most_ ||
           (!files_.empty() && std::chrono::steady_clock::now() - first_ > kLongest);
}

void SafeFiles::takePlacesAtOnce() {
    FlushedSystems systems;
    std::set<std::filesystem::path> folders;
    for (SafeFile& file : files_) {
        bool const isFlushed = systems.hold(file.descriptor()) || file.flush();
        if (isFlushed && file.takePlace()) folders.insert(file.folder());
    }
    for (std::filesystem::path const& folder : folders)
        flushFolder(folder);
}

std::vector<std::string> SafeFiles::takePlaces() {
    std::vector<std::string> reasons;
    reasons.reserve(files_.size());
    if (files_.size() == 1)
        (void)files_.front().commit();  // its problem says whether
    else
        takePlacesAtOnce();
    for (SafeFile const& file : files_)
        reasons.push_back(file.problem() == 0 ? std::string() : file.reason());
    files_.clear();
    releaseSignals();
    return reasons;
}

}  // namespace tzhost
