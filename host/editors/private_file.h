#pragma once

#include <filesystem>
#include <optional>
#include <string>
#include <string_view>

// A file in a folder that nobody else can look into; both are removed with this object.
namespace tzhost {

class PrivateFile {
public:
    // Makes the folder and writes the file; `made()` tells whether that worked.
    PrivateFile(std::string_view name, std::string_view bytes);
    PrivateFile(PrivateFile const&) = delete;
    PrivateFile& operator=(PrivateFile const&) = delete;
    ~PrivateFile();

    [[nodiscard]] bool made() const { return made_; }
    [[nodiscard]] std::filesystem::path const& path() const { return file_; }
    // What the file holds now; nothing when it cannot be read.
    [[nodiscard]] std::optional<std::string> read() const;
    // Leaves folder and file where they are.
    void keep() { kept_ = true; }

private:
    std::filesystem::path folder_;
    std::filesystem::path file_;
    bool made_ = false;
    bool kept_ = false;
};

}  // namespace tzhost
