// Windows around a whole drawing of 100,000 entities, whose texts are measured. The floor is the
// same number of entities in windows around drawings of 1,000: the cost of an entity must not grow
// with the drawing.
#include <benchmark/benchmark.h>

#include <memory>

#include "bench/support/against_floor.h"
#include "bench/support/filled_drawing.h"
#include "tz/ed/selection.h"

namespace {

constexpr double kMost = 1.3;
constexpr int kSmall = 1000;
constexpr int kLarge = 100000;

// How many entities the window finds.
int selectAll(tzhost::Drawing* drawing, wchar_t const* mode) {
    tzhost::setWorkingDrawing(drawing);
    double const low[] = {-1, -100, 0};
    double const high[] = {1000, 10000, 0};
    long long set[2];
    int found = 0;
    if (tzedSSGet(mode, low, high, nullptr, set) != Tzad::ePromptNormal) return 0;
    (void)tzedSSLength(set, &found);
    tzedSSFree(set);
    return found;
}

void selectWith(benchmark::State& state, wchar_t const* mode) {
    auto const small = tzbench::drawingWith(kSmall);
    auto const large = tzbench::drawingWith(kLarge);
    if (selectAll(small.get(), mode) != kSmall || selectAll(large.get(), mode) != kLarge) {
        state.SkipWithError("the window misses something");
    }
    tzbench::AgainstFloor against(state, kMost);
    while (state.KeepRunning())
        against.turn([&] { return selectAll(large.get(), mode); },
                     [&] {
                         int found = 0;
                         while (found < kLarge)
                             found += selectAll(small.get(), mode);
                         return found;
                     });
    tzhost::setWorkingDrawing(nullptr);
}

BENCHMARK_CAPTURE(selectWith, window, L"W")->UseManualTime()->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(selectWith, crossing, L"C")->UseManualTime()->Unit(benchmark::kMillisecond);

}  // namespace
