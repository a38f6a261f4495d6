#include "module/align/spacing/text_planes.h"

#include <algorithm>

// The point is asked first: it tells most planes apart, and for less.
bool isTheSamePlane(TzGePlane const& a, TzGePlane const& b) {
    return a.isOn(b.pointOnPlane()) && a.isParallelTo(b);
}

bool isCoordSystemParalle(TzGeMatrix3d const& a, TzGeMatrix3d const& b) {
    return a.xAxis().isParallelTo(b.xAxis());
}

void TextPlanes::insert(TzGePlane const& plane, TzDbObjectId id) {
    bool isNew = true;
    for (int index = 0; index < static_cast<int>(groups_.size()); ++index) {
        if (!isTheSamePlane(plane, groups_[static_cast<std::size_t>(index)].plane)) continue;
        add(index, id);
        isNew = false;
    }
    if (!isNew) return;
    groups_.push_back({plane, {}});
    add(static_cast<int>(groups_.size()) - 1, id);
}

void TextPlanes::add(int index, TzDbObjectId id) {
    std::vector<TzDbObjectId>& ids = groups_[static_cast<std::size_t>(index)].ids;
    ids.push_back(id);
    recordMajority(static_cast<int>(ids.size()), index);
}

void TextPlanes::recordMajority(int count, int index) {
    if (count <= best_) return;
    best_ = count;
    bestIndex_ = index;
}

std::vector<TzDbObjectId> TextPlanes::majority() const {
    if (bestIndex_ < 0) return {};
    return groups_[static_cast<std::size_t>(bestIndex_)].ids;
}

void TextAxes::insert(TzGeMatrix3d const& system) {
    auto const alike = std::find_if(groups_.begin(), groups_.end(), [&system](Group const& group) {
        return isCoordSystemParalle(system, group.system);
    });
    if (alike != groups_.end()) {
        ++alike->count;
    } else {
        groups_.push_back({system, 1});
    }
}

std::optional<TzGeMatrix3d> TextAxes::majority() const {
    auto const largest =
        std::max_element(groups_.begin(), groups_.end(), [](Group const& a, Group const& b) {
            return a.count < b.count;
        });  // the first of equals
    if (largest == groups_.end()) return std::nullopt;
    return largest->system;
}
