#pragma once

#include <cstdint>
#include <span>
#include <vector>

struct TzDbObjectRecord;

// Which objects of a drawing changed, for whoever keeps something computed from them. Nothing is
// kept until somebody watches, and then no more than the last changes: noting one costs next to
// nothing and cannot fail.
//
//   journal.watch();
//   auto const seen = journal.end();
//   ... commands ...
//   if (!journal.knows(seen)) beginAnew();
//   for (ChangeJournal::Change const& change : journal.since(seen)) ...
namespace tzhost {

class ChangeJournal {
public:
    // Values changed, or are about to, erasing included; an object came to the end of its owner's
    // list, or left it.
    enum class Kind : std::uint8_t { values, listed, unlisted };
    struct Change {
        TzDbObjectRecord* record;
        Kind kind;
    };

    void watch();
    void note(TzDbObjectRecord& record, Kind kind) noexcept;
    // The number of the next change.
    [[nodiscard]] std::uint64_t end() const { return first_ + changes_.size(); }
    // Whether all changes from that number on are still here.
    [[nodiscard]] bool knows(std::uint64_t number) const { return number >= first_; }
    [[nodiscard]] std::span<Change const> since(std::uint64_t number) const;

private:
    std::vector<Change> changes_;  // with memory for all that are ever kept, once it is watched
    std::uint64_t first_ = 0;      // the number of the first of them
};

}  // namespace tzhost
