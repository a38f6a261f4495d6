#pragma once

#include <string>
#include <unordered_map>

namespace tzhost {

// Names of files made comparable, so that a program can refuse to write one file twice, or over
// what it reads: names that lead to the same file have the same real path. Links are followed, and
// files need not be there yet.
//
//   RealPaths paths;
//   paths.of("./plan.json") == paths.of("plan.json");
//
// Folders are looked up once, so that an object serves one run of comparisons.
class RealPaths {
public:
    [[nodiscard]] std::string of(std::string const& file);

private:
    [[nodiscard]] std::string const& realFolder(std::string const& folder);

    std::unordered_map<std::string, std::string> folders_;  // real ones
};

}  // namespace tzhost
