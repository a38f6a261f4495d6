#include "host/selection/selecting.h"

#include <utility>

#include "host/selection/input_filters.h"
#include "host/text/local_text.h"
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

Selecting::Records& Selecting::members() {
    for (; indexed_ < entities_.length(); ++indexed_)
        members_.insert(entities_[indexed_].record());
    return members_;
}

std::wstring Selecting::add(EntityIds const& ids) {
    Records const& known = members();
    EntityIds fresh;
    int locked = 0;
    int leftOut = 0;
    for (TzDbObjectId const id : ids) {
        if (entityOf(id) == nullptr || (!known.empty() && known.count(id.record()) > 0)) continue;
        if (mode_.leavesOutLocked && isOnLockedLayer(id)) {
            ++locked;
        } else if (filter_.lets(id)) {
            fresh.append(id);
        } else {
            ++leftOut;
        }
    }
    leftOut += fresh.length();
    if (!fresh.isEmpty()) filterAdded(entities_, fresh);
    leftOut -= fresh.length();
    entities_.append(fresh);
    std::wstring report = counted(fresh.length(), localText(L"%d found"));
    if (locked > 0) report += counted(locked, localText(L", %d on a locked layer"));
    if (leftOut > 0) report += counted(leftOut, localText(L", %d left out"));
    return report;
}

std::wstring Selecting::remove(EntityIds const& ids) {
    Records& known = members();
    EntityIds going;
    for (TzDbObjectId const id : ids) {
        if (known.count(id.record()) > 0) going.append(id);
    }
    if (!going.isEmpty()) filterRemoved(entities_, going);
    for (TzDbObjectId const id : going)
        known.erase(id.record());
    EntityIds staying;
    for (TzDbObjectId const id : entities_) {
        if (known.count(id.record()) > 0) staying.append(id);
    }
    entities_ = std::move(staying);
    indexed_ = entities_.length();
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
