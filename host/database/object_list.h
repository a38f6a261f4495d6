#pragma once

#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "host/database/object_record.h"

// The objects that a table or a block lists, in order. Undo keeps no copies of such a list: it
// takes out what a step put in. So adding to a long list costs no more than adding to a short one.
namespace tzhost {

struct ObjectList {
    std::vector<TzDbObjectRecord*> items;
};

// Puts `item` at the end of the list of `owner`, if it has one.
void addToList(TzDbObjectRecord& owner, TzDbObjectRecord& item);
// Takes the last listing of `item` out of the list of `owner`, if it has one.
void removeFromList(TzDbObjectRecord& owner, TzDbObjectRecord& item) noexcept;
// The list of a table, a block or a block reference; null for other objects.
[[nodiscard]] ObjectList* listOf(TzDbObjectRecord const& owner);

// Records of a table by name, without regard to case. Kept up to date by a counter of renamings.
class NameIndex {
public:
    [[nodiscard]] TzDbObjectRecord* find(ObjectList const& list, std::wstring_view name);

private:
    void rebuild(ObjectList const& list);

    std::unordered_map<std::wstring, TzDbObjectRecord*> byName_;  // lower case
    std::size_t indexed_ = 0;                                     // so many items of the list
    unsigned int generation_ = 0;
};

}  // namespace tzhost
