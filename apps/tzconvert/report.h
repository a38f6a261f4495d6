#pragma once

// What conversions found, as JSON for other programs.

#include <string>
#include <vector>

#include "apps/tzconvert/conversion.h"

namespace tzconvert {

struct FileReport {
    std::string file;
    MarkupFindings found;
};

// One object, of the only report, which must be there; when results go into a folder, a list of
// them, each with its file's name.
[[nodiscard]] std::string reportText(Options const& options,
                                     std::vector<FileReport> const& reports);

}  // namespace tzconvert
