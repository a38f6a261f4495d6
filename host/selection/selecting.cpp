#include "host/selection/selecting.h"

#include <utility>

#include "host/base/local_text.h"
#include "host/selection/input_filters.h"
#include "tz/rx/status.h"
#include "tz/text/string.h"

namespace tzhost {

namespace {

std::wstring counted(int count, wchar_t const* format) {
    return TzString::formatted(format, count).str();
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
    std::wstring report = counted(fresh.length(), localText(L"%d found"));
    if (locked > 0) report += counted(locked, localText(L", %d on a locked layer"));
    if (leftOut > 0) report += counted(leftOut, localText(L", %d left out"));
    return report;
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
    return counted(going.length(), localText(L"%d removed"));
}

int Selecting::finish(int status) {
    if (status != Tzad::ePromptNormal) entities_.removeAll();
    if (status == Tzad::ePromptNormal && entities_.isEmpty()) status = Tzad::ePromptError;
    filterAtEnd(status, entities_);
    if (status == Tzad::ePromptNormal && entities_.isEmpty()) status = Tzad::ePromptError;
    return status;
}

}  // namespace tzhost
