#include "host/selection/selection_sets.h"

#include <map>
#include <utility>

#include "host/base/audit.h"
#include "host/base/fault_point.h"
#include "host/base/memory_faults.h"
#include "tz/ed/selection.h"
#include "tz/rx/status.h"

namespace tzhost {

namespace {

constexpr long long kMark = 0x5365744E616D65;  // the second number of a set's name

struct Sets {
    std::map<long long, EntityIds> byNumber;
    long long next = 1;
};

Sets& sets() {
    static Sets all;
    return all;
}

bool isNameOfSet(long long const* name) {
    return name != nullptr && name[1] == kMark && name[0] > 0 && name[0] < sets().next;
}

}  // namespace

void nameNewSet(EntityIds ids, long long* name) {
    sets().byNumber.emplace(sets().next, std::move(ids));
    name[0] = sets().next++;
    name[1] = kMark;
    ++audit().selectionSets;
}

void nameNoSet(long long* name) {
    name[0] = name[1] = 0;
}

EntityIds const* findSet(long long const* name) {
    if (!isNameOfSet(name)) return nullptr;
    auto const at = sets().byNumber.find(name[0]);
    return at == sets().byNumber.end() ? nullptr : &at->second;
}

void freeAllSets() {
    audit().selectionSets -= static_cast<int>(sets().byNumber.size());
    sets().byNumber.clear();
}

}  // namespace tzhost

int tzedSSLength(long long const* set, int* length) {
    if (auto const fault = tzhost::faultAt("tzedSSLength")) return *fault;
    tzhost::EntityIds const* const ids = tzhost::findSet(set);
    if (ids == nullptr || length == nullptr) return Tzad::ePromptError;
    *length = ids->length();
    return Tzad::ePromptNormal;
}

int tzedSSName(long long const* set, int index, long long* name) {
    if (auto const fault = tzhost::faultAt("tzedSSName")) return *fault;
    tzhost::EntityIds const* const ids = tzhost::findSet(set);
    bool const isThere = ids != nullptr && index >= 0 && index < ids->length();
    if (!isThere || tzdbGetTzsName(name, (*ids)[index]) != Tzad::eOk) return Tzad::ePromptError;
    return Tzad::ePromptNormal;
}

// Frees the set even when the plan makes it report a failure.
int tzedSSFree(long long const* set) {
    tzhost::MemoryFaultPause const givesBack;
    auto const fault = tzhost::faultAt("tzedSSFree");
    bool const wasSet = tzhost::isNameOfSet(set);
    if (wasSet && tzhost::sets().byNumber.erase(set[0]) > 0) --tzhost::audit().selectionSets;
    if (fault) return *fault;
    return wasSet ? Tzad::ePromptNormal : Tzad::ePromptError;
}

// Dropping the implied selection gives something back, so that no fault keeps it.
int tzedSSSetFirst(long long const* /*grips*/, long long const* selected) {
    auto const fault = tzhost::faultAt("tzedSSSetFirst");
    if (selected == nullptr) {
        tzhost::dropImpliedSelection();
        return fault ? *fault : Tzad::ePromptNormal;
    }
    if (fault) return *fault;
    tzhost::EntityIds const* const ids = tzhost::findSet(selected);
    if (ids == nullptr) return Tzad::ePromptError;
    tzhost::setImpliedSelection(*ids);
    return Tzad::ePromptNormal;
}
