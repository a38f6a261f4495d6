#include "bench/support/against_floor.h"

#include <algorithm>
#include <ctime>

namespace tzbench {

namespace {

double medianOf(std::vector<double>& values) {
    if (values.empty()) return 0;
    auto const middle = values.begin() + static_cast<std::ptrdiff_t>(values.size() / 2);
    std::nth_element(values.begin(), middle, values.end());
    return *middle;
}

}  // namespace

AgainstFloor::AgainstFloor(benchmark::State& state, double bound, int calls)
    : state_(state), bound_(bound), calls_(calls) {}

double AgainstFloor::processorSeconds() {
    timespec used{};
    (void)clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &used);  // cannot fail with these arguments
    return static_cast<double>(used.tv_sec) + static_cast<double>(used.tv_nsec) * 1e-9;
}

AgainstFloor::~AgainstFloor() {
    double const work = medianOf(works_) / calls_;
    double const floor = medianOf(floors_) / calls_;
    state_.counters["work"] = work;
    state_.counters["floor"] = floor;
    state_.counters["ratio"] = floor > 0 ? work / floor : 0;
    state_.counters["bound"] = bound_;
}

}  // namespace tzbench
