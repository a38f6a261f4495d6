#include "apps/tzdraft/own_files.h"

#include <system_error>

namespace tzdraft {
namespace {

// The same for each way to name a file, as far as the system tells.
std::filesystem::path plainPath(std::filesystem::path const& file) {
    std::error_code unknown;
    std::filesystem::path plain = std::filesystem::weakly_canonical(file, unknown);
    return unknown ? file : plain;
}

std::filesystem::file_time_type writtenAt(std::filesystem::path const& file) {
    std::error_code unknown;  // then it is the same each time
    return std::filesystem::last_write_time(file, unknown);
}

}  // namespace

void OwnFiles::note(std::filesystem::path const& file) {
    written_[plainPath(file)] = writtenAt(file);
}

OwnFiles::Standing OwnFiles::standingOf(std::filesystem::path const& file) const {
    auto const at = written_.find(plainPath(file));
    if (at == written_.end()) return Standing::foreign;
    return at->second == writtenAt(file) ? Standing::own : Standing::changed;
}

}  // namespace tzdraft
