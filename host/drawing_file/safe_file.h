#pragma once

#include <filesystem>
#include <string>
#include <string_view>

namespace tzhost::drawingfile {

// A file that is written piece by piece and takes the place of the old one only when it is whole:
// the pieces go to a temporary file in the same folder, which `commit` flushes to the disk and
// renames. A symbolic link is followed; an old file's permissions stay. Without `commit` the
// temporary file goes away and the old one stays.
class SafeFile {
public:
    explicit SafeFile(std::filesystem::path const& target);
    SafeFile(SafeFile const&) = delete;
    SafeFile& operator=(SafeFile const&) = delete;
    ~SafeFile();

    [[nodiscard]] bool isOpen() const { return file_ >= 0; }
    [[nodiscard]] bool write(std::string_view bytes);
    [[nodiscard]] bool commit();
    // What went wrong first, in the system's words.
    [[nodiscard]] std::string const& reason() const { return reason_; }

private:
    [[nodiscard]] bool fail();

    std::filesystem::path target_;
    std::string temporary_;
    int file_ = -1;
    std::string reason_;
};

}  // namespace tzhost::drawingfile
