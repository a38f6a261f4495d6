// Plots of 20,000 notes of 25 letters as text, beside the same glyphs as plain paths: their time,
// and beside it the bytes of both files.
#include <benchmark/benchmark.h>

#include <set>
#include <string>

#include "bench/support/against_floor.h"
#include "host/display/plot_paint.h"

namespace {

using namespace tzhost;

constexpr int kNotes = 20'000;
constexpr int kNotesInARow = 100;
constexpr wchar_t kNote[] = L"Drain %05d to the manhole";

PlotScene notes() {
    DrawList list;
    for (int i = 0; i < kNotes; ++i) {
        DrawOp op;
        op.pen.color = TzCmEntityColor::fromIndex(7);
        DrawnText text{TzString::formatted(kNote, i),
                       TzGePoint3d(i % kNotesInARow * 40.0, i / kNotesInARow * 5.0, 0.0),
                       TzGeVector3d::kZAxis,
                       TzGeVector3d::kXAxis,
                       {},
                       true};
        text.style.setTextSize(2.0);
        text.style.setFont(L"DejaVu Sans", false, false, 0, 0);
        op.what = text;
        list.push_back(op);
    }
    return makeScene(std::move(list), ViewAxes());
}

// The same shapes without the glyphs that they show.
PlotScene plainPaths(PlotScene const& scene) {
    return [scene](ShapeTaker const& take) {
        scene([&](PlotShape const& shape) {
            PlotShape plain = shape;
            plain.glyphs.clear();
            take(plain);
        });
    };
}

std::size_t bytesOf(PlotSheet const& sheet, PlotFormat format) {
    std::size_t bytes = 0;
    std::set<std::string> lockedFaces;
    ByteTaker const count = [&](std::string_view part) {
        bytes += part.size();
        return true;
    };
    benchmark::DoNotOptimize(paintPlot({sheet}, format, count, lockedFaces));
    return bytes;
}

void plotNotes(benchmark::State& state) {
    constexpr double kMostTime = 1.5;
    auto const format = static_cast<PlotFormat>(state.range(0));
    PlotSheet const text = fittedSheet(notes(), format);
    PlotSheet plain = text;
    plain.scene = plainPaths(text.scene);
    tzbench::AgainstFloor against(state, kMostTime);
    while (state.KeepRunning())
        against.turn([&] { return bytesOf(text, format); }, [&] { return bytesOf(plain, format); });
}
BENCHMARK(plotNotes)
    ->Arg(static_cast<int>(PlotFormat::svg))
    ->Arg(static_cast<int>(PlotFormat::pdf))
    ->UseManualTime()
    ->Iterations(3)
    ->Unit(benchmark::kMillisecond);

// The ratio is that of the sizes: a byte counts as a microsecond.
void sizeOfNotes(benchmark::State& state) {
    constexpr double kMostSize = 0.5;
    auto const format = static_cast<PlotFormat>(state.range(0));
    PlotSheet const text = fittedSheet(notes(), format);
    PlotSheet plain = text;
    plain.scene = plainPaths(text.scene);
    double ours = 0.0;
    double theirs = 0.0;
    while (state.KeepRunning()) {
        ours = static_cast<double>(bytesOf(text, format));
        theirs = static_cast<double>(bytesOf(plain, format));
        state.SetIterationTime(ours * 1e-6);
    }
    state.counters["work"] = ours;
    state.counters["floor"] = theirs;
    state.counters["ratio"] = ours / theirs;
    state.counters["bound"] = kMostSize;
}
BENCHMARK(sizeOfNotes)
    ->Arg(static_cast<int>(PlotFormat::svg))
    ->Arg(static_cast<int>(PlotFormat::pdf))
    ->UseManualTime()
    ->Iterations(1)
    ->Unit(benchmark::kMillisecond);

}  // namespace
