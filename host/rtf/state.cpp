#include "host/rtf/state.h"

namespace tzhost {

RtfState::RtfState() {
    values_.fill(kRtfUnset);
    values_[indexOf(RtfField::inTable)] = 0;
    values_[indexOf(RtfField::inListText)] = 0;
    values_[indexOf(RtfField::stackMark)] = 0;
    values_[indexOf(RtfField::substitutes)] = 1;
    values_[indexOf(RtfField::destination)] = 0;
}

void RtfState::set(RtfField field, int value) {
    std::size_t const at = indexOf(field);
    if (values_[at] == value) return;
    if (savedAt_[at] != depth_) {
        saved_.push_back({depth_, savedAt_[at], values_[at], field});
        savedAt_[at] = depth_;
    }
    values_[at] = value;
    ++changes_;
}

void RtfState::open() {
    ++depth_;
}

bool RtfState::close() {
    if (depth_ == 0) return false;
    for (; !saved_.empty() && saved_.back().depth == depth_; saved_.pop_back()) {
        Saved const& last = saved_.back();
        values_[indexOf(last.field)] = last.value;
        savedAt_[indexOf(last.field)] = last.olderDepth;
        ++changes_;
    }
    --depth_;
    return true;
}

}  // namespace tzhost
