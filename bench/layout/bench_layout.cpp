// Laying out MTEXT of growing length. The floor lays out the same characters as texts of the
// smallest length, one after the other: the time for a character must not grow with the length.
#include <benchmark/benchmark.h>

#include <cstddef>
#include <string>

#include "bench/support/against_floor.h"
#include "host/layout/mtext_layout.h"

namespace {

constexpr wchar_t const* kParts[] = {L"plain words and ", L"{\\C1;a}\\Lb\\l \\S1/2;\\P"};
constexpr std::size_t kShort = 1000;
constexpr double kMostGrowth = 1.3;

tzhost::MTextLayoutInput textOf(wchar_t const* part, std::size_t length) {
    tzhost::MTextLayoutInput input;
    while (input.contents.size() < length)
        input.contents += part;
    input.width = 50.0;
    input.textHeight = 1.0;
    return input;
}

void layOut(benchmark::State& state) {
    wchar_t const* const part = kParts[state.range(0)];
    auto const times = static_cast<std::size_t>(state.range(1));
    tzhost::MTextLayoutInput const whole = textOf(part, times * kShort);
    tzhost::MTextLayoutInput const piece = textOf(part, kShort);
    tzbench::AgainstFloor against(state, kMostGrowth);
    while (state.KeepRunning()) {
        against.turn([&] { return tzhost::layOutMText(whole); },
                     [&] {
                         for (std::size_t i = 1; i < times; ++i)
                             benchmark::DoNotOptimize(tzhost::layOutMText(piece));
                         return tzhost::layOutMText(piece);
                     });
    }
}

BENCHMARK(layOut)->ArgsProduct({{0, 1}, {10, 300}})->UseManualTime()->Unit(benchmark::kMillisecond);

}  // namespace
