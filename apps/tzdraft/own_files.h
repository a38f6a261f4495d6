#pragma once

#include <filesystem>
#include <map>

// The files that a session opened or wrote. It may write over them without a question, as long as
// nobody else has written to them since.
namespace tzdraft {

class OwnFiles {
public:
    enum class Standing { foreign, changed, own };

    // Notes a file as it is now: it was opened, or written.
    void note(std::filesystem::path const& file);
    // Whichever way the file is named.
    [[nodiscard]] Standing standingOf(std::filesystem::path const& file) const;

private:
    std::map<std::filesystem::path, std::filesystem::file_time_type> written_;
};

}  // namespace tzdraft
