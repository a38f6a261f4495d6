#pragma once

#include <filesystem>
#include <new>
#include <string>
#include <vector>

#include "host/text/local_text.h"

// The files that a run writes at its end, and what went wrong with them. One that cannot be written
// keeps none of the others back.
namespace tzdraft {

class Results {
public:
    // Notes that a file was written, or why it was not; an empty name is no file. `write` takes the
    // place for an error, and fails by that or by an exception when memory runs short.
    template <class Write>
    void write(std::filesystem::path const& file, Write write);
    void noteProblem(std::string problem);
    // A line for each problem, the last one with the files that were written all the same.
    [[nodiscard]] std::vector<std::string> problems() const;

private:
    void noteWritten(std::filesystem::path const& file);

    std::vector<std::string> problems_;
    std::string written_;  // with commas between them
};

template <class Write>
void Results::write(std::filesystem::path const& file, Write write) {
    if (file.empty()) return;
    std::string error;
    try {
        (void)write(error);  // the error says it
    } catch (std::bad_alloc const&) {
        error = file.string() + ": " + tzhost::localText("there is not enough memory to write it");
    }
    if (error.empty()) {
        noteWritten(file);
    } else {
        noteProblem(error);
    }
}

}  // namespace tzdraft
