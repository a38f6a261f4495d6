#pragma once

#include <filesystem>
#include <string>
#include <string_view>

struct stat;

namespace tzhost {

// The file that a symbolic link leads to over any number of links, whether it is there or not. The
// path itself when it is no link, when its links form a ring, and when what it leads to has no
// path, such as a pipe.
[[nodiscard]] std::filesystem::path followLinks(std::filesystem::path const& path);

// Flushes a folder, so that renamings in it survive a crash. Where folders cannot be flushed the
// system does it in its own time. An empty path is the working folder.
void flushFolder(std::filesystem::path const& folder);

// What becomes of a file that may not be written to.
enum class IfReadOnly { refuse, replace };

// A file that is written piece by piece and takes the place of the old one only when it is whole.
// The pieces go to an unfinished file in the same folder (part_file.h), which `commit` flushes to
// the disk and renames, so that a crash leaves the old file or the new one; the next save removes
// the unfinished file. A symbolic link is followed. The old file's owner and permissions stay: a
// save that could not keep them fails. Without `commit` the old file stays. What is no file (a
// device, a pipe) is written to as it is. So is the file that the program's own output or messages
// go to: what stands in it stays.
//
//   SafeFile file("plan.json");
//   if (!file.isOpen() || !file.write(bytes) || !file.commit()) complain(file.reason());
//
// A limit on the size of files is a failure like any other and raises no signal.
class SafeFile {
public:
    explicit SafeFile(std::filesystem::path const& target,
                      IfReadOnly ifReadOnly = IfReadOnly::refuse);
    SafeFile(SafeFile const&) = delete;
    SafeFile& operator=(SafeFile const&) = delete;
    ~SafeFile();

    [[nodiscard]] bool isOpen() const { return file_ >= 0; }
    [[nodiscard]] bool write(std::string_view bytes);
    [[nodiscard]] bool commit();
    // The steps of commit, for files that take their places together (safe_files.h): the flush,
    // which another way to the disk may stand for; the renaming; then flushFolder.
    [[nodiscard]] bool flush();
    [[nodiscard]] bool takePlace();
    [[nodiscard]] int descriptor() const { return file_; }
    [[nodiscard]] std::filesystem::path folder() const { return target_.parent_path(); }
    // The system's number of what went wrong first, 0 for nothing, and its words.
    [[nodiscard]] int problem() const { return problem_; }
    [[nodiscard]] std::string reason() const;

private:
    // Makes the unfinished file; `old` is the file that it will replace, null for none.
    void makePart(struct stat const* old);
    [[nodiscard]] bool fail();  // with errno
    [[nodiscard]] bool fail(int problem);

    std::filesystem::path target_;
    std::string part_;  // path of the unfinished file; empty for none
    int file_ = -1;
    int problem_ = 0;
    char const* words_ = nullptr;  // in place of the system's words for the problem
};

}  // namespace tzhost
