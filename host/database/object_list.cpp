#include "host/database/object_list.h"

#include <algorithm>

#include "host/database/drawing.h"
#include "host/database/symbol_imp.h"

namespace tzhost {
namespace {

std::wstring folded(std::wstring_view name) {
    std::wstring lower(name);
    std::transform(lower.begin(), lower.end(), lower.begin(), tzToLower);
    return lower;
}

std::wstring const& nameOf(TzDbObjectRecord const& record) {
    return valuesOf<SymbolImp>(*record.object).name;
}

}  // namespace

ObjectList* listOf(TzDbObjectRecord const& owner) {
    if (!owner.object) return nullptr;
    return TzDbObjectAccess::imp(*owner.object)->list();
}

void addToList(TzDbObjectRecord& owner, TzDbObjectRecord& item) {
    ObjectList* const list = listOf(owner);
    if (!list) return;
    list->items.push_back(&item);
    item.drawing->changes().note(item, ChangeJournal::Kind::listed);
}

void removeFromList(TzDbObjectRecord& owner, TzDbObjectRecord& item) noexcept {
    ObjectList* const list = listOf(owner);
    if (!list) return;
    item.drawing->changes().note(item, ChangeJournal::Kind::unlisted);
    auto const at = std::find(list->items.rbegin(), list->items.rend(), &item);
    if (at != list->items.rend()) list->items.erase(std::next(at).base());
}

void NameIndex::rebuild(ObjectList const& list) {
    byName_.clear();
    indexed_ = 0;
    generation_ = namesGeneration();
    for (TzDbObjectRecord* const record : list.items) {
        if (!record->erased) byName_.try_emplace(folded(nameOf(*record)), record);
    }
    indexed_ = list.items.size();
}

TzDbObjectRecord* NameIndex::find(ObjectList const& list, std::wstring_view name) {
    if (generation_ != namesGeneration() || indexed_ > list.items.size()) rebuild(list);
    for (; indexed_ < list.items.size(); ++indexed_) {
        TzDbObjectRecord* const record = list.items[indexed_];
        if (!record->erased) byName_.try_emplace(folded(nameOf(*record)), record);
    }
    auto const at = byName_.find(folded(name));
    return at == byName_.end() ? nullptr : at->second;
}

}  // namespace tzhost
