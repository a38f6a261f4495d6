#include "host/base/change_journal.h"

#include <cstddef>

namespace tzhost {

void ChangeJournal::watch() {
    constexpr std::size_t kMost = std::size_t{1} << 15;
    changes_.reserve(kMost);
}

void ChangeJournal::note(TzDbObjectRecord& record, Kind kind) noexcept {
    if (changes_.capacity() == 0) return;
    if (changes_.size() == changes_.capacity()) {
        first_ = end();
        changes_.clear();
    }
    changes_.push_back({&record, kind});
}

std::span<ChangeJournal::Change const> ChangeJournal::since(std::uint64_t number) const {
    return std::span(changes_).subspan(static_cast<std::size_t>(number - first_));
}

}  // namespace tzhost
