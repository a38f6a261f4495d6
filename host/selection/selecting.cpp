#include "host/selection/selecting.h"

#include <utility>

#include "host/selection/input_filters.h"
#include "tz/rx/status.h"

namespace tzhost {

namespace {

std::wstring counted(int count, std::wstring_view what) {
    return count > 0 ? L", " + std::to_wstring(count) + std::wstring(what) : std::wstring();
}

}  // namespace

Selecting::Selecting(SelectionMode mode, ListFilter filter)
    : mode_(mode), filter_(std::move(filter)) {}

std::wstring Selecting::add(EntityIds const& ids) {
    EntityIds fresh;
    std::set<TzDbObjectId> seen;
    int locked = 0;
    for (TzDbObjectId const id : ids) {
        if (members_.count(id) > 0 || !seen.insert(id).second || entityOf(id) == nullptr) continue;
        if (mode_.leavesOutLocked && isOnLockedLayer(id)) {
            ++locked;
        } else if (filter_.lets(id)) {
            fresh.append(id);
        }
    }
    if (!fresh.isEmpty()) filterAdded(entities_, fresh);
    for (TzDbObjectId const id : fresh)
        members_.insert(id);
    int const leftOut = static_cast<int>(seen.size()) - locked - fresh.length();
    entities_.append(fresh);
    return std::to_wstring(fresh.length()) + L" found" + counted(locked, L" on a locked layer") +
           counted(leftOut, L" left out");
}

std::wstring Selecting::remove(EntityIds const& ids) {
    EntityIds going;
    std::set<TzDbObjectId> seen;
    for (TzDbObjectId const id : ids) {
        if (members_.count(id) > 0 && seen.insert(id).second) going.append(id);
    }
    if (!going.isEmpty()) filterRemoved(entities_, going);
    for (TzDbObjectId const id : going)
        members_.erase(id);
    EntityIds staying;
    for (TzDbObjectId const id : entities_) {
        if (members_.count(id) > 0) staying.append(id);
    }
    entities_ = std::move(staying);
    return std::to_wstring(going.length()) + L" removed";
}

int Selecting::finish(int status) {
    if (status != Tzad::ePromptNormal) entities_.removeAll();
    if (status == Tzad::ePromptNormal && entities_.isEmpty()) status = Tzad::ePromptError;
    filterAtEnd(status, entities_);
    if (status == Tzad::ePromptNormal && entities_.isEmpty()) status = Tzad::ePromptError;
    return status;
}

}  // namespace tzhost
