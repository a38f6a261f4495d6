#include "host/files/json_store.h"

#include <vector>

namespace tzhost {

JsonValue JsonStore::keep(JsonValue const& value) {
    JsonValue kept = value;
    kept.text = keep(value.text);
    std::vector<JsonValue> items;
    for (JsonValue const& item : value.items)
        items.push_back(keep(item));
    kept.items = keep(items.data(), items.size());
    std::vector<JsonMember> members;
    for (auto const& [name, member] : value.members)
        members.push_back({keep(name), keep(member)});
    kept.members = keep(members.data(), members.size());
    return kept;
}

}  // namespace tzhost
