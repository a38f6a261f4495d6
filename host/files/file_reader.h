#pragma once

// A file that is read from its start to its end in pieces, for callers who do not need its bytes as
// a whole.
//
//   FileReader reader(path);
//   std::array<char, 1 << 16> piece;
//   while (std::size_t const size = reader.read(piece.data(), piece.size())) take(piece, size);
//   if (reader.hasFailed()) complain(systemReason());
//
// Folders are refused; pipes and devices are read. Reading fails beyond 1 GiB.

#include <cstddef>
#include <string>

namespace tzhost {

class FileReader {
public:
    // A file that cannot be opened has failed.
    explicit FileReader(std::string const& path);
    // Standard input, which stays open.
    FileReader() = default;
    ~FileReader();
    FileReader(FileReader const&) = delete;
    FileReader& operator=(FileReader const&) = delete;

    // The number of bytes in the file, as the system says; 0 for a pipe.
    [[nodiscard]] std::size_t expectedSize() const;
    // Reads the next `size` bytes, fewer only at the end. The number of bytes; 0 at the end and
    // when reading fails.
    [[nodiscard]] std::size_t read(char* to, std::size_t size);
    // Whether opening or reading failed; errno then says why.
    [[nodiscard]] bool hasFailed() const { return hasFailed_; }

private:
    int file_ = 0;
    std::size_t total_ = 0;
    bool hasFailed_ = false;
    bool isAtEnd_ = false;
};

}  // namespace tzhost
