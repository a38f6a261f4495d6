#include "host/command_line/symbol_names.h"

#include "host/database/object_list.h"
#include "tz/db/symbol_table.h"
#include "tz/rx/class.h"

namespace tzhost {

std::vector<std::wstring> symbolNames(TzDbObjectId table) {
    std::vector<std::wstring> names;
    ObjectList const* const list = table.isNull() ? nullptr : listOf(*table.record());
    if (!list) return names;
    for (TzDbObjectRecord const* const each : list->items) {
        auto const* const symbol =
            tzrxCast<TzDbSymbolTableRecord>(static_cast<TzRxObject const*>(each->object));
        std::wstring const name = symbol && !each->erased ? symbol->getName() : L"";
        if (!name.empty() && !name.starts_with(L'*')) names.push_back(name);
    }
    return names;
}

}  // namespace tzhost
