#include "host/selection/box_index.h"

#include <algorithm>
#include <cstring>
#include <list>
#include <memory>
#include <new>
#include <utility>

#include "host/database/drawing.h"
#include "host/database/object_list.h"
#include "host/database/symbol_imp.h"
#include "host/database/user_system.h"
#include "host/selection/box_tree.h"
#include "tz/db/shapes.h"

namespace tzhost {

namespace {

using Items = std::vector<TzDbObjectRecord*>;

bool isSame(TzGeMatrix3d const& a, TzGeMatrix3d const& b) {
    return std::memcmp(&a, &b, sizeof a) == 0;
}

constexpr std::size_t kFew = 64;   // items of a list that needs no tree
constexpr std::size_t kShare = 8;  // of a list; what concerns more of it is a walk's work

// A list that was asked about, with its tree once that is worth while.
struct Asked {
    long long drawing;
    TzDbObjectRecord const* owner;
    TzGeMatrix3d placed;
    TzGeMatrix3d user;
    // At the last question: the generation of the text styles, the current one, which texts without
    // a style show, and the drawing's changes.
    unsigned int looks = 0;
    TzDbObjectId style = {};
    std::uint64_t seen = 0;
    std::unique_ptr<BoxTree> tree = {};

    [[nodiscard]] bool isAbout(Asked const& other) const {
        return drawing == other.drawing && owner == other.owner && isSame(placed, other.placed) &&
               isSame(user, other.user);
    }
};

// Leaves out from the end on what is too much to keep: the memory of a drawing may be taken for its
// boxes once, but not for each place where a block stands.
void keepFew(std::list<Asked>& all) {
    constexpr std::size_t kMost = 32;
    constexpr std::size_t kMostItems = 1'000'000;
    if (all.size() > kMost) all.pop_back();
    std::size_t items = 0;
    std::erase_if(all, [&](Asked const& each) {
        items += each.tree ? each.tree->size() : 0;
        return items > kMostItems && &each != &all.front();
    });
}

// The one that was asked about before, else a new one. The last few are kept.
Asked& find(Asked wanted) {
    static std::list<Asked> all;  // the latest first
    all.remove_if([](Asked const& each) { return drawingWithSerial(each.drawing) == nullptr; });
    auto const at = std::find_if(all.begin(), all.end(),
                                 [&](Asked const& each) { return each.isAbout(wanted); });
    if (at != all.end()) {
        all.splice(all.begin(), all, at);
    } else {
        all.push_front(std::move(wanted));
    }
    keepFew(all);
    return all.front();
}

// The tree of a list; null when this question is better answered by a walk. That is the first one,
// and the first one after much has changed, so that a session of great changes pays for no trees.
BoxTree const* treeOf(Asked& one, Items const& items, ChangeJournal& journal) {
    journal.watch();
    std::uint64_t const seen = std::exchange(one.seen, journal.end());
    unsigned int const looks = std::exchange(one.looks, looksGeneration());
    TzDbObjectId const style = std::exchange(one.style, one.owner->drawing->textstyle());
    std::unique_ptr<BoxTree> tree = std::move(one.tree);  // gone when memory fails below
    if (looks != one.looks || style != one.style || !journal.knows(seen)) return nullptr;
    auto const changes = journal.since(seen);
    if (tree && !tree->follow(changes)) return nullptr;
    if (!tree) {
        if (changes.size() > items.size() / kShare) return nullptr;
        tree = std::make_unique<BoxTree>(*one.owner, one.placed);
        tree->build(items);
    }
    one.tree = std::move(tree);
    return one.tree.get();
}

// A list is worth a tree when it is long, or when a box of it is much work.
bool isWorthATree(Items const& items) {
    return items.size() >= kFew || std::any_of(items.begin(), items.end(), [](auto* record) {
               return dynamic_cast<TzDbBlockReference*>(record->object) != nullptr;
           });
}

// Without the memory for a tree a question is answered by a walk too.
BoxTree const* treeOf(TzDbObjectRecord const& owner, TzGeMatrix3d const& placed) try {
    Items const& items = listOf(owner)->items;
    if (!isWorthATree(items)) return nullptr;
    Asked& one = find({owner.drawing->serial(), &owner, placed, currentUserSystem().matrix()});
    return treeOf(one, items, owner.drawing->changes());
} catch (std::bad_alloc const&) {
    return nullptr;
}

}  // namespace

std::vector<TzDbObjectRecord*>
itemsNear(TzDbObjectRecord const* owner, TzGeMatrix3d const& placed, FlatBox const& box) {
    if (owner == nullptr || listOf(*owner) == nullptr) return {};
    BoxTree const* const tree = treeOf(*owner, placed);
    auto items = tree ? tree->itemsIn(box) : std::nullopt;
    return items ? std::move(*items) : listOf(*owner)->items;
}

ItemsAtPoint
itemsAt(TzDbObjectRecord const* owner, TzGeMatrix3d const& placed, TzGePoint2d const& point) {
    if (owner == nullptr || listOf(*owner) == nullptr) return {};
    BoxTree const* const tree = treeOf(*owner, placed);
    if (tree == nullptr) return {listOf(*owner)->items, false};
    auto items = tree->itemsIn({point, point});
    if (!items) items = listOf(*owner)->items;
    std::erase_if(*items, [&](TzDbObjectRecord* item) { return !tree->boxHolds(item, point); });
    return {std::move(*items), true};
}

}  // namespace tzhost
