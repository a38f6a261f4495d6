#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <unordered_map>
#include <unordered_set>
#include <vector>

#include <boost/geometry.hpp>
#include <boost/geometry/index/rtree.hpp>

#include "host/base/change_journal.h"
#include "host/database/object_record.h"
#include "host/selection/outline.h"

namespace tzhost {

// The boxes of the items of one list in one user system.
//
// It always names what a walk over the list would find. A box follows from the values of its item
// and of what that owns, which the journal names when they change; from layers, styles and the
// content of the blocks that references show, whose changes make the tree begin anew; and from the
// user system and the place of the list, which belong to the tree. System variables have no part in
// it. All points of an outline are finite and lie in its box, so what an outline touches or lies
// within meets that box.
class BoxTree {
public:
    BoxTree(TzDbObjectRecord const& owner, TzGeMatrix3d const& placed)
        : owner_(owner), placed_(placed) {}

    // Takes all items of the list.
    void build(std::vector<TzDbObjectRecord*> const& items);
    // Takes over what changed; false when it must be built anew, or that would cost less.
    [[nodiscard]] bool follow(std::span<ChangeJournal::Change const> changes);
    // The items whose boxes can meet the box, in the order of the list; nothing when that is all of
    // the list.
    [[nodiscard]] std::optional<std::vector<TzDbObjectRecord*>> itemsIn(FlatBox const& box) const;
    // Whether the box of an item of the tree holds a point, as Outline::boxHolds says.
    [[nodiscard]] bool boxHolds(TzDbObjectRecord* item, TzGePoint2d const& point) const;
    // How many items it keeps, about 200 bytes each.
    [[nodiscard]] std::size_t size() const { return entries_.size(); }

private:
    using Point = boost::geometry::model::d2::point_xy<double>;
    using Box = boost::geometry::model::box<Point>;
    struct Item {
        TzDbObjectRecord* record;
        std::uint64_t place;  // grows along the list

        friend bool operator==(Item const& a, Item const& b) { return a.record == b.record; }
    };
    using Leaf = std::pair<Box, Item>;
    static constexpr std::size_t kFanOut = 16;
    using Tree = boost::geometry::index::rtree<Leaf, boost::geometry::index::quadratic<kFanOut>>;
    struct Entry {
        std::uint64_t place;
        std::optional<FlatBox> box;  // nothing for what lies nowhere
    };

    // The item that a changed object belongs to; null with what it means for all of them.
    enum class Reach { item, none, all };
    [[nodiscard]] Reach reachOf(TzDbObjectRecord* changed, TzDbObjectRecord*& item) const;
    void noteBlocks(TzDbObjectRecord const& item);
    void list(TzDbObjectRecord& item);
    void unlist(TzDbObjectRecord& item);
    // An item as the tree keeps it, in a slightly larger box; nothing when it lies nowhere or is
    // too large for that.
    [[nodiscard]] static std::optional<Leaf> leafOf(Entry const& entry, TzDbObjectRecord& item);
    [[nodiscard]] std::optional<FlatBox> boxOf(TzDbObjectRecord& item) const;
    void renew(TzDbObjectRecord& item);
    void takeOut(Entry const& entry, TzDbObjectRecord& item);

    TzDbObjectRecord const& owner_;
    TzGeMatrix3d placed_;
    std::unordered_map<TzDbObjectRecord*, Entry> entries_;
    std::unordered_set<TzDbObjectRecord*> boundless_;  // met by every box
    Tree tree_;
    std::uint64_t lastPlace_ = 0;
    std::unordered_set<TzDbObjectRecord const*> blocks_;  // that references show, in others too
};

}  // namespace tzhost
