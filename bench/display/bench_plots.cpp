// Plots of 20,000 notes of 25 letters as text, beside the same glyphs as plain paths: their time,
// their bytes, and the memory that they take.
#include <benchmark/benchmark.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <random>
#include <set>
#include <string>

#include "bench/support/against_floor.h"
#include "host/display/plot_paint.h"

namespace {

using namespace tzhost;

constexpr int kNotes = 20'000;
constexpr int kLetters = 25;  // of a note

struct Face {
    wchar_t const* name;
    wchar_t first;  // of the letters that it is asked for
    unsigned int letters;
};
constexpr Face kFaces[] = {
    {L"DejaVu Sans", L'!', 62},
    {L"DejaVu Serif", L'\u00C0', 190},
    {L"Droid Sans Fallback", L'\u4E00', 6000},
    {L"Liberation Sans", L'\u0410', 64},
};

// What the notes say: one text with a number in it, or letters by chance in a face by turns.
enum Words { numbered, byChance };

struct Note {
    wchar_t const* face;
    std::wstring text;
};

Note noteOf(Words words, int number) {
    if (words == numbered) {
        TzString const text = TzString::formatted(L"Drain %05d to the manhole", number);
        return {kFaces[0].name, text.str()};
    }
    static std::mt19937 chance(1);
    Face const& face = kFaces[static_cast<std::size_t>(number) % std::size(kFaces)];
    Note note{face.name, {}};
    for (int i = 0; i < kLetters; ++i)
        note.text += static_cast<wchar_t>(face.first + static_cast<int>(chance() % face.letters));
    return note;
}

void add(DrawList& list, Note const& note, TzGePoint3d const& place) {
    DrawOp op;
    op.pen.color = TzCmEntityColor::fromIndex(7);
    DrawnText text{note.text.c_str(), place, TzGeVector3d::kZAxis, TzGeVector3d::kXAxis, {}, true};
    text.style.setTextSize(2.0);
    text.style.setFont(note.face, false, false, 0, 0);
    op.what = text;
    list.push_back(op);
}

PlotScene notes(Words words) {
    constexpr int kNotesInARow = 100;
    DrawList list;
    for (int i = 0; i < kNotes; ++i) {
        add(list, noteOf(words, i),
            TzGePoint3d(i % kNotesInARow * 60.0, i / kNotesInARow * 5.0, 0.0));
    }
    return makeScene(std::move(list), ViewAxes());
}

// The letters of all notes in one text.
PlotScene oneNote() {
    Note whole{kFaces[0].name, {}};
    for (int i = 0; i < kNotes; ++i)
        whole.text += noteOf(numbered, i).text;
    DrawList list;
    add(list, whole, TzGePoint3d());
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
    constexpr double kMostTime = 0.8;
    auto const format = static_cast<PlotFormat>(state.range(0));
    PlotSheet const text = fittedSheet(notes(static_cast<Words>(state.range(1))), format);
    PlotSheet plain = text;
    plain.scene = plainPaths(text.scene);
    tzbench::AgainstFloor against(state, kMostTime);
    while (state.KeepRunning())
        against.turn([&] { return bytesOf(text, format); }, [&] { return bytesOf(plain, format); });
}

// One text of as many letters takes as long as all notes.
void plotOneText(benchmark::State& state) {
    constexpr double kMostTime = 1.3;
    auto const format = static_cast<PlotFormat>(state.range(0));
    tzbench::AgainstFloor against(state, kMostTime);
    while (state.KeepRunning()) {
        against.turn([&] { return bytesOf(fittedSheet(oneNote(), format), format); },
                     [&] { return bytesOf(fittedSheet(notes(numbered), format), format); });
    }
}

void tell(benchmark::State& state, double work, double floor, double bound) {
    state.counters["work"] = work;
    state.counters["floor"] = floor;
    state.counters["ratio"] = work / floor;
    state.counters["bound"] = bound;
}

void sizeOfNotes(benchmark::State& state) {
    constexpr double kMostSize = 0.1;
    auto const format = static_cast<PlotFormat>(state.range(0));
    PlotSheet const text = fittedSheet(notes(static_cast<Words>(state.range(1))), format);
    PlotSheet plain = text;
    plain.scene = plainPaths(text.scene);
    for (auto _ : state) {
        tell(state, static_cast<double>(bytesOf(text, format)),
             static_cast<double>(bytesOf(plain, format)), kMostSize);
    }
}

// The peak of memory of a process that plots the notes.
double peakOf(PlotFormat format, Words words) {
    constexpr double kKilobyte = 1024.0;
    pid_t const child = fork();
    if (child == 0) {
        benchmark::DoNotOptimize(bytesOf(fittedSheet(notes(words), format), format));
        _exit(0);
    }
    rusage used{};
    int status = 0;
    return wait4(child, &status, 0, &used) == child && status == 0
               ? static_cast<double>(used.ru_maxrss) * kKilobyte
               : 0.0;
}

// Against a kilobyte for each letter.
void memoryOfNotes(benchmark::State& state) {
    constexpr double kMostBytes = 1024.0;
    auto const format = static_cast<PlotFormat>(state.range(0));
    for (auto _ : state) {
        double const peak = peakOf(format, static_cast<Words>(state.range(1)));
        if (peak == 0.0) return state.SkipWithError("the plot failed");
        tell(state, peak, kMostBytes * kNotes * kLetters, 1.0);
    }
}

void eachFormat(benchmark::internal::Benchmark* bench) {
    constexpr int kSvg = static_cast<int>(PlotFormat::svg);
    constexpr int kPdf = static_cast<int>(PlotFormat::pdf);
    bench->ArgsProduct({{kSvg, kPdf}, {numbered, byChance}})->Iterations(1);
}
// The processes of the first start small.
BENCHMARK(memoryOfNotes)->Apply(eachFormat)->Unit(benchmark::kMillisecond);
BENCHMARK(plotNotes)->Apply(eachFormat)->UseManualTime()->Unit(benchmark::kMillisecond);
BENCHMARK(plotOneText)
    ->Arg(static_cast<int>(PlotFormat::svg))
    ->Arg(static_cast<int>(PlotFormat::pdf))
    ->UseManualTime()
    ->Iterations(1)
    ->Unit(benchmark::kMillisecond);
BENCHMARK(sizeOfNotes)->Apply(eachFormat)->Unit(benchmark::kMillisecond);

}  // namespace
