#pragma once

// Several files that are written as SafeFile does and take their places together. The wait for the
// disk, which is most of the time of a small save, is had once for all of them.
//
//   SafeFiles files;
//   for (...) {
//       complain(files.add(path, bytes));
//       if (files.areDue()) complain(files.takePlaces());
//   }
//   complain(files.takePlaces());
//
// A crash leaves each file as it was or new. Signals that end the program (interrupt, hang-up,
// termination, a reader of its output that is gone) wait while files wait, so that none leaves
// unfinished files; hence areDue.

#include <chrono>
#include <csignal>
#include <cstddef>
#include <deque>
#include <string>
#include <string_view>
#include <vector>

#include "host/files/safe_file.h"

namespace tzhost {

class SafeFiles {
public:
    SafeFiles();
    SafeFiles(SafeFiles const&) = delete;
    SafeFiles& operator=(SafeFiles const&) = delete;
    // Files that wait are given up.
    ~SafeFiles();

    // Writes a file that will take its place. Empty, or why that failed: then it does not wait.
    [[nodiscard]] std::string add(std::string const& path, std::string_view bytes);
    // Whether as many wait as a process should hold open, or for as long as a signal should wait.
    [[nodiscard]] bool areDue() const;
    // Of each file that waits, in their order: empty, or why it is as it was before. None waits
    // afterwards.
    [[nodiscard]] std::vector<std::string> takePlaces();

private:
    void holdSignals();
    void releaseSignals();
    void takePlacesAtOnce();

    std::deque<SafeFile> files_;
    std::size_t most_;
    std::chrono::steady_clock::time_point first_;  // when the first one came to wait
    bool holdsSignals_ = false;
    sigset_t before_;  // the signals that were held before
};

}  // namespace tzhost
