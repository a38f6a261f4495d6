#include "host/selection/pick.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <iterator>
#include <string>

#include "host/database/drawing.h"
#include "host/database/object_list.h"
#include "host/database/open_state.h"
#include "host/display/record_access.h"
#include "host/selection/box_index.h"
#include "host/selection/outline.h"
#include "host/text/utf8.h"
#include "tz/db/shapes.h"

namespace tzhost {

namespace {

constexpr wchar_t kHandleMark = L'#';
constexpr wchar_t kInside = L'/';
constexpr int kDeepest = 64;  // references within references; those further in are not looked into
constexpr std::ptrdiff_t kMostLooks = 1'000'000;

// What stands inside a block reference: its attributes, which have the reference's own coordinates,
// and the entities of its block.
struct Inside {
    TzDbObjectRecord const* owner;  // that lists them; null for none
    TzGeMatrix3d placed;

    [[nodiscard]] ObjectList const* list() const { return owner ? listOf(*owner) : nullptr; }
    [[nodiscard]] std::ptrdiff_t size() const { return list() ? std::ssize(list()->items) : 0; }
    // The items whose boxes may hold the point.
    [[nodiscard]] ItemsAtPoint at(TzGePoint3d const& user) const {
        return itemsAt(owner, placed, user.convert2d());
    }
};

std::vector<Inside> insidesOf(Picked const& reference) {
    auto const* const insert = objectOf<TzDbBlockReference>(reference.id);
    if (insert == nullptr) return {};
    return {
        {reference.id.record(), reference.placed},
        {insert->blockTableRecord().record(), reference.placed * insert->blockTransform()},
    };
}

// The entity `record` inside a reference. An attribute is placed as its reference is, which so
// counts as none around it.
Picked stepInto(Picked const& outer, Inside const& inside, TzDbObjectRecord* record) {
    Picked inner{outer.top, TzDbObjectId(record), outer.references, inside.placed};
    if (record->owner != outer.id.record()) inner.references.push_back(outer.id);
    return inner;
}

bool boxHolds(TzDbObjectRecord* record, TzGeMatrix3d const& placed, TzGePoint3d const& user) {
    TzDbEntity* const entity = entityOf(TzDbObjectId(record));
    return entity != nullptr && Outline::of(*entity, placed).boxHolds(user.convert2d());
}

// Blocks within blocks can stand for more than one can look at: `looks` says how many entities the
// blocks within the first one may have that the search looks into yet. All of a block count, also
// when an index leaves most of them out, so that no pick depends on whether there is one.
std::optional<Picked>
pickInside(Picked const& outer, TzGePoint3d const& user, int depth, std::ptrdiff_t& looks) {
    if (objectOf<TzDbBlockReference>(outer.id) == nullptr) return outer;
    if (depth == kDeepest) return std::nullopt;
    for (Inside const& inside : insidesOf(outer)) {
        if (depth > 0 && (looks -= inside.size()) < 0) return std::nullopt;
        auto const [items, holdIt] = inside.at(user);
        for (auto at = items.rbegin(); at != items.rend(); ++at) {
            if (!holdIt && !boxHolds(*at, inside.placed, user)) continue;
            auto const found = pickInside(stepInto(outer, inside, *at), user, depth + 1, looks);
            if (found) return found;
        }
    }
    return std::nullopt;
}

std::optional<Picked> findInside(Picked const& outer, std::uint64_t handle) {
    for (Inside const& inside : insidesOf(outer)) {
        ObjectList const* const list = inside.list();
        if (list == nullptr) continue;
        auto const at =
            std::find_if(list->items.begin(), list->items.end(), [handle](auto const* record) {
                return record->handle == handle && !record->erased;
            });
        if (at != list->items.end()) return stepInto(outer, inside, *at);
    }
    return std::nullopt;
}

}  // namespace

std::optional<Picked> pickAt(TzGePoint3d const& user, Depth depth) {
    Drawing const* const drawing = workingDrawing();
    if (drawing == nullptr) return std::nullopt;
    Inside const space{drawing->activeSpace().record(), TzGeMatrix3d::kIdentity};
    auto const [items, holdIt] = space.at(user);
    for (auto at = items.rbegin(); at != items.rend(); ++at) {
        if (!holdIt && !boxHolds(*at, TzGeMatrix3d::kIdentity, user)) continue;
        Picked const top{TzDbObjectId(*at), TzDbObjectId(*at), {}, {}};
        if (depth == Depth::top) return top;
        std::ptrdiff_t looks = kMostLooks;
        if (auto const found = pickInside(top, user, 0, looks)) return found;
    }
    return std::nullopt;
}

bool isHandles(std::wstring_view text) {
    return text.starts_with(kHandleMark);
}

std::optional<Picked> pickByHandles(std::wstring_view text) {
    Drawing const* const drawing = workingDrawing();
    if (drawing == nullptr || !isHandles(text)) return std::nullopt;
    text.remove_prefix(1);
    std::optional<Picked> picked;
    for (bool isMore = true; isMore;) {
        std::size_t const end = text.find(kInside);
        auto const handle = readHandle(toUtf8(text.substr(0, end)));
        if (!handle) return std::nullopt;
        if (picked) {
            picked = findInside(*picked, *handle);
        } else if (TzDbObjectId const id = drawing->objectAt(*handle); isInActiveSpace(id)) {
            picked = Picked{id, id, {}, {}};
        }
        if (!picked) return std::nullopt;
        isMore = end != std::wstring_view::npos;
        if (isMore) text.remove_prefix(end + 1);
    }
    return picked;
}

}  // namespace tzhost
