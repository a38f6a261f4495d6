#include "apps/tzdraft/results.h"

#include <utility>

namespace tzdraft {

void Results::noteProblem(std::string problem) {
    problems_.push_back(std::move(problem));
}

void Results::noteWritten(std::filesystem::path const& file) {
    if (!written_.empty()) written_ += ", ";
    written_ += file.string();
}

std::vector<std::string> Results::problems() const {
    std::vector<std::string> lines = problems_;
    if (!lines.empty() && !written_.empty())
        lines.back() += "; " + tzhost::localText("written: ") + written_;
    return lines;
}

}  // namespace tzdraft
