#pragma once

// Where results go: to standard output at once, into files together.

#include <string>
#include <string_view>
#include <vector>

#include "apps/tzconvert/streams.h"
#include "host/files/safe_files.h"

namespace tzconvert {

class Results {
public:
    // Writes a result, to standard output for an empty name. A file takes its place by `settle`.
    [[nodiscard]] Failure write(std::string const& file, std::wstring_view text);
    [[nodiscard]] Failure write(std::string const& file, std::string_view bytes);

    // Whether files should take their places before more is done.
    [[nodiscard]] bool areDue() const { return files_.areDue(); }
    // Of each file that was written since the last time, in their order.
    [[nodiscard]] std::vector<Failure> settle();

private:
    tzhost::SafeFiles files_;
    std::vector<std::string> names_;
};

}  // namespace tzconvert
