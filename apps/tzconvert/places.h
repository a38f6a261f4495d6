#pragma once

// Where results go, and what they may not take the place of.

#include <string>
#include <unordered_set>

#include "apps/tzconvert/inputs.h"
#include "apps/tzconvert/options.h"
#include "apps/tzconvert/streams.h"
#include "host/files/real_paths.h"

namespace tzconvert {

// Where a file's result goes: in a folder, under its own name with the ending of the result. Empty
// for standard output.
[[nodiscard]] std::string targetOf(Options const& options, Input const& input);

// What a run reads and has written. Nothing takes the place of an input, whatever its name there:
// of a file that is converted, of what standard input comes from, or of the font map. No result
// takes the place of another, and the report of none.
class Places {
public:
    Places(Options const& options, std::vector<Input> const& inputs);

    [[nodiscard]] Failure checkReport();
    // What tells a target from all others; empty for standard output.
    [[nodiscard]] std::string placeOf(std::string const& target);
    // Whether the result of a file may go there.
    [[nodiscard]] Failure
    checkTarget(std::string const& file, std::string const& target, std::string const& place);
    // A result that is not made keeps no place.
    void keep(std::string const& place);
    void drop(std::string const& place);

private:
    Options const& options_;
    std::vector<Input> const& files_;
    tzhost::RealPaths paths_;
    std::unordered_set<std::string> inputs_;
    std::unordered_set<std::string> targets_;  // the results that were written
};

}  // namespace tzconvert
