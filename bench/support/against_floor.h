#pragma once

#include <benchmark/benchmark.h>

#include <vector>

// Times work beside its floor, the least that the same job can cost. Both run in turns, so that
// whatever else the machine does meets both alike, and processor time is what counts. What is read
// is the ratio of the two medians, which the counters tell beside its bound and the times of one
// call in seconds.
//
//   void readNumber(benchmark::State& state) {
//       tzbench::AgainstFloor against(state, 5.0, 1000);
//       while (state.KeepRunning())
//           against.turn([] { return readOurs(kText); }, [] { return std::strtod(kText, nullptr);
//           });
//   }
//   BENCHMARK(readNumber)->UseManualTime();
//
// The time that the benchmark itself reports is that of one turn of the work.
namespace tzbench {

class AgainstFloor {
public:
    // `bound` is the most that the ratio may be; a turn makes `calls` calls of each.
    AgainstFloor(benchmark::State& state, double bound, int calls = 1);
    AgainstFloor(AgainstFloor const&) = delete;
    AgainstFloor& operator=(AgainstFloor const&) = delete;
    // Hands the counters to the benchmark.
    ~AgainstFloor();

    // What the last call of each returns ends outside the measure.
    template <class Work, class Floor>
    void turn(Work work, Floor floor) {
        floors_.push_back(secondsOf(floor));
        works_.push_back(secondsOf(work));
        state_.SetIterationTime(works_.back());
    }

private:
    // What the process has used so far.
    [[nodiscard]] static double processorSeconds();

    template <class Call>
    [[nodiscard]] double secondsOf(Call& call) const {
        double const start = processorSeconds();
        for (int left = calls_; left > 1; --left)
            benchmark::DoNotOptimize(call());
        auto last = call();
        benchmark::DoNotOptimize(last);
        return processorSeconds() - start;
    }

    benchmark::State& state_;
    double bound_;
    int calls_;
    std::vector<double> works_;  // seconds of each turn
    std::vector<double> floors_;
};

}  // namespace tzbench
