#include "apps/tzdraft/commands/selected.h"

#include "apps/tzdraft/commands/selection_set.h"
#include "tz/db/database.h"

namespace tzdraft {
namespace {

std::vector<TzDbObjectId> entitiesOf(SelectionSet const& set) {
    std::vector<TzDbObjectId> ids;
    int count = 0;
    if (tzedSSLength(set.name(), &count) != Tzad::ePromptNormal) return ids;
    for (int index = 0; index < count; ++index) {
        long long name[2];
        TzDbObjectId id;
        if (tzedSSName(set.name(), index, name) == Tzad::ePromptNormal &&
            tzdbGetObjectId(id, name) == Tzad::eOk) {
            ids.push_back(id);
        }
    }
    return ids;
}

}  // namespace

std::vector<TzDbObjectId> selectEntities(OnLockedLayers locked) {
    bool const all = locked == OnLockedLayers::included;
    SelectionSet set;
    if (set.select(all ? L"I" : L"I:L") || set.select(all ? L"" : L":L")) return entitiesOf(set);
    return {};
}

}  // namespace tzdraft
