// Both converters beside their floors. Plain text may take four times as long as appending the same
// characters to a growing wide string, text whose look changes every 40 characters twenty times.
//
// The sweeps show that the time for a character does not grow with the size: from 10 thousand to 50
// million characters (read and written) the ratio to the floor stays within 1.3 of the ratio at the
// smallest size. Times are those of the processor, and memory stays with the process,
// so that neither other work nor the first touch of memory is in them.
#include <benchmark/benchmark.h>

#include <algorithm>
#include <array>
#include <ctime>
#include <string>
#include <unordered_map>
#include <vector>

#include <malloc.h>

#include "bench/markup/texts.h"

namespace {

using tzbench::Sort;
using tzbench::TextKind;

constexpr std::array<std::size_t, 4> kSizes = {10000, 200000, 4000000, 50000000};
constexpr std::array<int, 4> kTurnsOf = {11, 11, 3, 1};  // the least of three differs by a third
constexpr char const* kSizeNames[] = {"10K", "200K", "4M", "50M"};
constexpr std::size_t kSpeedSize = 10000000;
constexpr std::size_t kLeastPerTurn = 1000000;  // characters that are timed at once
constexpr double kMostGrowth = 1.3;

// Freed memory is kept and used again.
void keepMemory() {
    (void)mallopt(M_MMAP_MAX, 0);
    (void)mallopt(M_TRIM_THRESHOLD, -1);
}

double processorSeconds() {
    timespec time{};
    (void)clock_gettime(CLOCK_THREAD_CPUTIME_ID, &time);
    return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_nsec) * 1e-9;
}

template <class Call>
double secondsOf(Call call) {
    double const start = processorSeconds();
    call();
    return processorSeconds() - start;
}

void appendAll(std::wstring const& text) {
    std::wstring copy;
    for (wchar_t const c : text)
        copy.push_back(c);
    benchmark::DoNotOptimize(copy.data());
}

// The least that entries of a table can cost: each is entered into a hash table under its own text.
void appendToTable(TextKind const& kind, std::wstring const& text) {
    appendAll(text);
    std::unordered_map<std::wstring, std::wstring> table;
    std::size_t start = kind.head.size();
    for (std::size_t end = 0; (end = text.find(kind.unit.back(), start)) != text.npos;) {
        std::wstring entry = text.substr(start, end + 1 - start);
        table.emplace(entry, entry);
        start = end + 1;
    }
    benchmark::DoNotOptimize(table.size());
}

struct Measure {
    double work;   // seconds for a character read or written
    double floor;  // the same for a character appended
};

// The least of a few turns, after one that brings the memory.
Measure measured(TextKind const& kind, std::size_t size, int turns) {
    std::wstring const text = tzbench::textOf(kind, size);
    std::size_t const again = std::max<std::size_t>(1, kLeastPerTurn / size);
    ConversionSession session(tzbench::startOfTexts());
    std::size_t written = 0;
    Measure least{1e9, 1e9};
    for (int turn = 0; turn <= turns; ++turn) {
        double const floor = secondsOf([&] {
            for (std::size_t i = 0; i < again; ++i)
                kind.sort == Sort::entries ? appendToTable(kind, text) : appendAll(text);
        });
        double const work = secondsOf([&] {
            for (std::size_t i = 0; i < again; ++i)
                written = tzbench::converted(session, kind.way, text).size();
        });
        if (turn == 0) continue;
        auto const characters = static_cast<double>(text.size() * again);
        least.floor = std::min(least.floor, floor / characters);
        least.work =
            std::min(least.work, work / static_cast<double>((text.size() + written) * again));
    }
    return least;
}

void speed(benchmark::State& state, TextKind const& kind) {
    constexpr int kTurns = 5;
    while (state.KeepRunning()) {
        std::wstring const text = tzbench::textOf(kind, kSpeedSize);
        ConversionSession session(tzbench::startOfTexts());
        double work = 1e9;
        double floor = 1e9;
        for (int turn = 0; turn < kTurns; ++turn) {
            floor = std::min(floor, secondsOf([&] { appendAll(text); }));
            work = std::min(work,
                            secondsOf([&] { (void)tzbench::converted(session, kind.way, text); }));
        }
        state.counters["work"] = work;
        state.counters["floor"] = floor;
        state.counters["ratio"] = work / floor;
        state.counters["bound"] = kind.sort == Sort::dense ? 20 : 4;
    }
}

void sweep(benchmark::State& state, TextKind const& kind) {
    while (state.KeepRunning()) {
        double first = 0;
        double growth = 0;
        for (std::size_t i = 0; i < kSizes.size() && kSizes[i] <= kind.mostSize; ++i) {
            Measure const each = measured(kind, kSizes[i], kTurnsOf[i]);
            double const ratio = each.work / each.floor;
            if (i == 0) first = ratio;
            growth = std::max(growth, ratio / first);
            state.counters[kSizeNames[i]] = ratio;
        }
        state.counters["ratio"] = growth;
        state.counters["bound"] = kMostGrowth;
    }
}

void declare() {
    for (TextKind const& kind : tzbench::textKinds()) {
        std::string const name = kind.name;
        auto const once = [](benchmark::internal::Benchmark* each) {
            each->Iterations(1)->Unit(benchmark::kMillisecond);
        };
        if (kind.sort == Sort::plain || kind.sort == Sort::dense)
            once(benchmark::RegisterBenchmark(("speed/" + name).c_str(), speed, kind));
        once(benchmark::RegisterBenchmark(("sweep/" + name).c_str(), sweep, kind));
    }
}

bool const kIsDeclared = [] {
    keepMemory();
    declare();
    return true;
}();

}  // namespace
