#pragma once

#include <filesystem>
#include <string>
#include <string_view>

namespace tzhost {

// The file that a symbolic link leads to over any number of links, be it there yet or not. The path
// itself when it is no link, when its links form a ring, and when what it leads to has no path, as
// a pipe has none.
[[nodiscard]] std::filesystem::path followLinks(std::filesystem::path const& path);

// A file that is written piece by piece and takes the place of the old one only when it is whole:
// the pieces go to a temporary file in the same folder, which `commit` flushes to the disk and
// renames, so that a crash leaves the old file or the new one. A symbolic link is followed; an old
// file's permissions stay. Without `commit` the temporary file goes away and the old one stays.
// What is no file (a device, a pipe) is written to as it is, and so is the file that the program's
// own output or messages go to: what stands in it stays.
//
//   SafeFile file("plan.json");
//   if (!file.isOpen() || !file.write(bytes) || !file.commit()) complain(file.reason());
//
// A limit on the size of files is a failure like any other and raises no signal.
class SafeFile {
public:
    explicit SafeFile(std::filesystem::path const& target);
    SafeFile(SafeFile const&) = delete;
    SafeFile& operator=(SafeFile const&) = delete;
    ~SafeFile();

    [[nodiscard]] bool isOpen() const { return file_ >= 0; }
    [[nodiscard]] bool write(std::string_view bytes);
    [[nodiscard]] bool commit();
    // The system's number of what went wrong first, 0 for nothing, and its words.
    [[nodiscard]] int problem() const { return problem_; }
    [[nodiscard]] std::string reason() const;

private:
    void makeTemporary();
    [[nodiscard]] bool fail();

    std::filesystem::path target_;
    std::string temporary_;
    int file_ = -1;
    int problem_ = 0;
};

}  // namespace tzhost
