#include "host/selection/box_tree.h"

#include <algorithm>
#include <cmath>
#include <iterator>

#include "host/database/object_list.h"
#include "host/display/record_access.h"
#include "host/selection/entity_list.h"
#include "tz/db/block_table.h"
#include "tz/db/shapes.h"

namespace tzhost {

namespace {

bool isA(TzDbObjectRecord const& record, TzRxClass* kind) {
    return record.object != nullptr && record.object->isKindOf(kind);
}

}  // namespace

std::optional<FlatBox> BoxTree::boxOf(TzDbObjectRecord& item) const {
    TzDbEntity* const entity = entityOf(TzDbObjectId(&item));
    return entity ? Outline::of(*entity, placed_).box() : std::nullopt;
}

std::optional<BoxTree::Leaf> BoxTree::leafOf(Entry const& entry, TzDbObjectRecord& item) {
    if (!entry.box) return std::nullopt;
    auto const& [low, high] = *entry.box;
    double const reach =
        std::max({std::abs(low.x), std::abs(low.y), std::abs(high.x), std::abs(high.y)});
    double const size = reach + (high.x - low.x) + (high.y - low.y);
    if (!std::isfinite(size * 2)) return std::nullopt;
    // More than what rounding can put a point of the item beyond its corners.
    double const slack = reach * 1e-9;
    return Leaf(Box({low.x - slack, low.y - slack}, {high.x + slack, high.y + slack}),
                {&item, entry.place});
}

// A block that is no longer shown stays noted: when it changes, the tree is built anew in vain.
void BoxTree::noteBlocks(TzDbObjectRecord const& item) {
    std::vector<TzDbObjectRecord const*> open{&item};
    while (!open.empty()) {
        auto const* const reference = dynamic_cast<TzDbBlockReference const*>(open.back()->object);
        open.pop_back();
        TzDbObjectRecord const* const block =
            reference ? reference->blockTableRecord().record() : nullptr;
        ObjectList const* const list = block ? listOf(*block) : nullptr;
        if (list == nullptr || !blocks_.insert(block).second) continue;
        open.insert(open.end(), list->items.begin(), list->items.end());
    }
}

void BoxTree::list(TzDbObjectRecord& item) {
    entries_[&item] = {++lastPlace_, std::nullopt};
}

void BoxTree::takeOut(Entry const& entry, TzDbObjectRecord& item) {
    if (auto const leaf = leafOf(entry, item)) tree_.remove(*leaf);
    boundless_.erase(&item);
}

void BoxTree::unlist(TzDbObjectRecord& item) {
    auto const at = entries_.find(&item);
    if (at == entries_.end()) return;
    takeOut(at->second, item);
    entries_.erase(at);
}

void BoxTree::renew(TzDbObjectRecord& item) {
    auto const at = entries_.find(&item);
    if (at == entries_.end()) return;
    Entry& entry = at->second;
    takeOut(entry, item);
    entry.box = boxOf(item);
    noteBlocks(item);
    if (auto const leaf = leafOf(entry, item)) {
        tree_.insert(*leaf);
    } else if (entry.box) {
        boundless_.insert(&item);
    }
}

void BoxTree::build(std::vector<TzDbObjectRecord*> const& items) {
    std::vector<Leaf> leaves;
    for (TzDbObjectRecord* const item : items) {
        list(*item);
        Entry& entry = entries_[item];
        entry.box = boxOf(*item);
        noteBlocks(*item);
        if (auto const leaf = leafOf(entry, *item)) {
            leaves.push_back(*leaf);
        } else if (entry.box) {
            boundless_.insert(item);
        }
    }
    tree_ = Tree(leaves);
}

BoxTree::Reach BoxTree::reachOf(TzDbObjectRecord* changed, TzDbObjectRecord*& item) const {
    // The owner's own values move none of its items: those of a block say where references place
    // it, and the place belongs to the tree; the attributes of a reference stand by coordinates of
    // their own.
    if (changed == &owner_) return Reach::none;
    for (item = changed; item != nullptr; item = item->owner) {
        if (item->owner == &owner_) return Reach::item;
        if (item->object == nullptr) return Reach::all;  // deleted: nobody knows what it was
        if (isA(*item, TzDbBlockTableRecord::desc()))
            return blocks_.contains(item) ? Reach::all : Reach::none;
        if (isA(*item, TzDbSymbolTableRecord::desc())) return Reach::all;
    }
    return Reach::none;
}

bool BoxTree::follow(std::span<ChangeJournal::Change const> changes) {
    using Kind = ChangeJournal::Kind;
    std::unordered_set<TzDbObjectRecord*> changed;
    for (auto const& [record, kind] : changes) {
        TzDbObjectRecord* item = nullptr;
        Reach const reach = reachOf(record, item);
        if (reach == Reach::all) return false;
        if (reach == Reach::none) continue;
        bool const isItself = item == record;
        if (isItself && kind == Kind::unlisted) unlist(*item);
        if (isItself && kind == Kind::listed) list(*item);
        changed.insert(item);
    }
    constexpr std::size_t kShare = 8;  // from so many on a walk costs as little
    if (changed.size() > entries_.size() / kShare) return false;
    for (TzDbObjectRecord* const item : changed)
        renew(*item);
    return true;
}

std::optional<std::vector<TzDbObjectRecord*>> BoxTree::itemsIn(FlatBox const& box) const {
    Box const wanted({box.low.x, box.low.y}, {box.high.x, box.high.y});
    if (boost::geometry::covered_by(tree_.bounds(), wanted)) return std::nullopt;
    std::vector<Leaf> leaves;
    tree_.query(boost::geometry::index::intersects(wanted), std::back_inserter(leaves));
    for (TzDbObjectRecord* const item : boundless_)
        leaves.emplace_back(Box(), Item{item, entries_.at(item).place});
    std::sort(leaves.begin(), leaves.end(),
              [](Leaf const& a, Leaf const& b) { return a.second.place < b.second.place; });
    std::vector<TzDbObjectRecord*> items;
    for (Leaf const& leaf : leaves)
        items.push_back(leaf.second.record);
    return items;
}

bool BoxTree::boxHolds(TzDbObjectRecord* item, TzGePoint2d const& point) const {
    auto const& box = entries_.at(item).box;
    return box && box->holds(point);
}

}  // namespace tzhost
