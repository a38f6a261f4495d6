#pragma once

// A file read from front to end in pieces, for who needs it in another form than bytes.
//
//   FileReader reader(path);
//   std::array<char, 1 << 16> piece;
//   while (std::size_t const size = reader.read(piece.data(), piece.size())) take(piece, size);
//   if (reader.hasFailed()) complain(systemReason());
//
// Folders are no files. A file over 1 GiB is not read.

#include <cstddef>
#include <string>

namespace tzhost {

class FileReader {
public:
    // One that cannot be opened has failed.
    explicit FileReader(std::string const& path);
    // Standard input, which stays open.
    FileReader() = default;
    ~FileReader();
    FileReader(FileReader const&) = delete;
    FileReader& operator=(FileReader const&) = delete;

    // How many bytes the file holds, as the system says; 0 of a pipe.
    [[nodiscard]] std::size_t expectedSize() const;
    // Puts the next bytes there, up to `size`; fewer only at the end. 0 at the end, and when
    // reading fails.
    [[nodiscard]] std::size_t read(char* to, std::size_t size);
    // Whether opening or reading failed; errno then says why.
    [[nodiscard]] bool hasFailed() const { return hasFailed_; }

private:
    int file_ = 0;
    std::size_t total_ = 0;
    bool hasFailed_ = false;
};

}  // namespace tzhost
