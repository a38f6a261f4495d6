#include "fuzz/markup/memory_file.h"

#include <cstdlib>

#include <sys/mman.h>
#include <sys/stat.h>
#include <unistd.h>

namespace markupfuzz {

namespace {

void require(bool isDone) {
    if (!isDone) std::abort();
}

}  // namespace

MemoryFile::MemoryFile()
    : file_(::memfd_create("font_map", MFD_CLOEXEC)),
      path_("/proc/self/fd/" + std::to_string(file_)) {
    require(file_ >= 0);
}

MemoryFile::~MemoryFile() {
    ::close(file_);
}

void MemoryFile::write(std::uint8_t const* data, std::size_t size) {
    require(::ftruncate(file_, 0) == 0);
    require(::pwrite(file_, data, size, 0) == static_cast<ssize_t>(size));
    timespec const change{++writes_, 0};
    timespec const times[] = {change, change};
    require(::futimens(file_, times) == 0);
}

}  // namespace markupfuzz
