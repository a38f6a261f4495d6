#pragma once

// What is to be converted: the files that were named, and those of the folders.

#include <filesystem>
#include <string>
#include <vector>

#include "apps/tzconvert/options.h"
#include "apps/tzconvert/streams.h"

namespace tzconvert {

struct Input {
    std::string file;              // "-" is standard input
    std::filesystem::path result;  // the result's name below the folder of the results
};

struct Inputs {
    std::vector<Input> files;
    std::vector<std::string> failures;  // of folders that cannot be read, a line each
};

// The files in the order that they were named in. A folder stands for the files in it and below it,
// by their names: .rtf where RTF is read, else .mtext and .txt, in any case. Names that begin with
// a dot, folders that are links, pipes and devices are left out, and so is the folder of the
// results where it lies below.
[[nodiscard]] Inputs inputsOf(Options const& options);

}  // namespace tzconvert
