#pragma once

#include <string>
#include <vector>

#include "host/layout/markup_reader.h"

// The notation of runs.txt, which describes itself at its head.
namespace tztest {

struct RunsCase {
    int line = 0;  // in the file
    std::string name;
    std::wstring markup;
    std::string runs;
};

// The cases of a file; empty when it cannot be read.
[[nodiscard]] std::vector<RunsCase> readRunsFile(std::string const& path);

// What was read, in the notation; `initial` is the look that needs no mark.
[[nodiscard]] std::string printRuns(tzhost::MarkupText const& read,
                                    tzhost::MarkupFormat const& initial);

}  // namespace tztest
