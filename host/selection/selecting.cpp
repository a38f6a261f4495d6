#include "host/selection/selecting.h"

#include <utility>

#include "host/selection/input_filters.h"
#include "tz/rx/status.h"

namespace tzhost {

Selecting::Selecting(SelectionMode mode, ListFilter filter)
    : mode_(mode), filter_(std::move(filter)) {}

Selecting::Records& Selecting::members() {
    for (; indexed_ < entities_.length(); ++indexed_)
        members_.insert(entities_[indexed_].record());
    return members_;
}

Added Selecting::add(EntityIds const& ids) {
    Records const& known = members();
    EntityIds fresh;
    Added added;
    for (TzDbObjectId const id : ids) {
        if (entityOf(id) == nullptr) continue;
        if (!known.empty() && known.count(id.record()) > 0) {
            ++added.alreadyThere;
        } else if (mode_.leavesOutLocked && isOnLockedLayer(id)) {
            ++added.onLockedLayers;
        } else if (filter_.lets(id)) {
            fresh.append(id);
        } else {
            ++added.leftOut;
        }
    }
    added.leftOut += fresh.length();
    if (!fresh.isEmpty()) filterAdded(entities_, fresh);
    added.leftOut -= fresh.length();
    entities_.append(fresh);
    added.fresh = fresh.length();
    added.total = entities_.length();
    return added;
}

Removed Selecting::remove(EntityIds const& ids) {
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
    return {going.length(), entities_.length()};
}

int Selecting::finish(int status) {
    if (status != Tzad::ePromptNormal) entities_.removeAll();
    if (status == Tzad::ePromptNormal && entities_.isEmpty()) status = Tzad::ePromptError;
    filterAtEnd(status, entities_);
    if (status == Tzad::ePromptNormal && entities_.isEmpty()) status = Tzad::ePromptError;
    return status;
}

}  // namespace tzhost
