#pragma once

#include <cstddef>
#include <cstdint>
#include <string>

namespace markupfuzz {

// A file that has a path but lies in memory alone. Its time of change differs with each write,
// however fast they follow on each other.
class MemoryFile {
public:
    MemoryFile();
    ~MemoryFile();
    MemoryFile(MemoryFile const&) = delete;
    MemoryFile& operator=(MemoryFile const&) = delete;

    [[nodiscard]] std::string const& path() const { return path_; }
    // Replaces what the file holds; ends the process when the system refuses.
    void write(std::uint8_t const* data, std::size_t size);

private:
    int file_;
    std::string path_;
    long writes_ = 0;
};

}  // namespace markupfuzz
