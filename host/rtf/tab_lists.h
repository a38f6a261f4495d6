#pragma once

// Lists of tab stops by number, so that a state holds one as a number. A list never changes; adding
// a stop gives another list.

#include <cstddef>
#include <deque>
#include <vector>

namespace tzhost {

class RtfTabLists {
public:
    static constexpr int kEmpty = 0;
    static constexpr int kMostStops = 32;  // the reader of the dialect knows no more

    // The list with a stop, in twips, added. Stops that it has, those below 1 and those beyond the
    // most are left out.
    [[nodiscard]] int withStop(int list, int twips);
    // Its stops in the order in which they were added; none of a number that is no list.
    [[nodiscard]] std::vector<int> stopsOf(int list) const;

private:
    struct Node {
        int before;
        int twips;
        int count;
    };
    [[nodiscard]] bool hasStop(int list, int twips) const;
    [[nodiscard]] bool isList(int list) const {
        return list > kEmpty && static_cast<std::size_t>(list) <= nodes_.size();
    }
    [[nodiscard]] Node const& nodeOf(int list) const {
        return nodes_[static_cast<std::size_t>(list) - 1];
    }

    std::deque<Node> nodes_;
};

}  // namespace tzhost
