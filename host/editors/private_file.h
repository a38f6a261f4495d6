#pragma once

#include <filesystem>
#include <optional>
#include <string>
#include <string_view>

// A file in a folder that nobody else can look into; both are removed with this object.
namespace tzhost {

// A new folder in the temporary directory, for its owner alone.
class PrivateFolder {
public:
    PrivateFolder();
    PrivateFolder(PrivateFolder const&) = delete;
    PrivateFolder& operator=(PrivateFolder const&) = delete;
    // Removes the folder with all that is in it, unless it is kept.
    ~PrivateFolder();

    [[nodiscard]] bool made() const { return made_; }
    [[nodiscard]] std::string const& path() const { return path_; }
    void setKept(bool kept) { kept_ = kept; }

private:
    std::string path_;
    bool made_ = false;
    bool kept_ = false;
};

class PrivateFile {
public:
    // Makes the folder and writes the file; `made()` tells whether that worked.
    PrivateFile(std::string_view name, std::string_view bytes);

    [[nodiscard]] bool made() const { return made_; }
    [[nodiscard]] std::filesystem::path const& path() const { return file_; }
    // Whether a file is there, be it readable or not; folders, pipes and devices are none.
    [[nodiscard]] bool isThere() const;
    // What the file holds now; nothing when it cannot be read.
    [[nodiscard]] std::optional<std::string> read() const;
    // Leaves folder and file where they are, or removes them after all when this object ends.
    void keep() { folder_.setKept(true); }
    void discard() { folder_.setKept(false); }

private:
    PrivateFolder folder_;  // before the path, so that a lack of memory for it leaves no folder
    std::filesystem::path file_;
    bool made_ = false;
};

}  // namespace tzhost
