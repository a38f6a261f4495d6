#include "host/base/job.h"

#include <utility>

namespace tzhost {

namespace {

// Steps between two looks of the watcher, so that a step costs less than the reading of a clock.
constexpr std::size_t kStepsPerLook = 16;

JobWatcher* installedWatcher = nullptr;
Job* innermost = nullptr;

}  // namespace

JobWatcher* setJobWatcher(JobWatcher* watcher) noexcept {
    return std::exchange(installedWatcher, watcher);
}

Job::Job(wchar_t const* name, std::size_t total)
    : outer_(std::exchange(innermost, this)),
      name_(name == nullptr && outer_ != nullptr ? outer_->name_ : name), total_(total) {
    if (outer_ == nullptr && installedWatcher != nullptr) installedWatcher->began();
}

Job::~Job() {
    innermost = outer_;
    if (outer_ == nullptr && installedWatcher != nullptr) installedWatcher->ended();
}

void Job::step() {
    if (innermost == nullptr || ++innermost->done_ % kStepsPerLook != 0) return;
    innermost->tell();
}

void Job::tell() const {
    if (name_ != nullptr && installedWatcher != nullptr)
        installedWatcher->reached(name_, done_, total_);
}

}  // namespace tzhost
