#pragma once

#include <filesystem>
#include <optional>
#include <string>

#include "host/files/safe_file.h"

// The file of events: one JSON object a line, in the order in which they happened. It gets its name
// when it is finished; a run that ends early leaves none.
namespace tzdraft {

class EventFile {
public:
    EventFile() = default;
    EventFile(EventFile const&) = delete;
    EventFile& operator=(EventFile const&) = delete;
    ~EventFile();

    // Begins to write what happens from now on; false and one line in `error` when the file cannot
    // be made.
    [[nodiscard]] bool begin(std::filesystem::path const& file, std::string& error);
    // Ends it under its own name. Without begin it does nothing and succeeds.
    [[nodiscard]] bool finish(std::string& error);

private:
    std::filesystem::path name_;
    std::optional<tzhost::SafeFile> file_;  // between begin and finish
    std::string pending_;                   // lines that are not written yet
};

}  // namespace tzdraft
