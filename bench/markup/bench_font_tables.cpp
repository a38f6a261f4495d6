// Look-ups of fonts by file and by face. The floor is a find with a ready key in an ordered map of
// the same size: at 10, 200 and 2,000 entries a look-up may take 6, 4 and 3 times as long.
#include <benchmark/benchmark.h>

#include <map>

#include "tz/mte/font_map_database.h"

namespace {

CStdStrW nameOf(wchar_t const* format, std::int64_t number) {
    CStdStrW name;
    name.Fmt(format, static_cast<int>(number));
    return name;
}

class Table {
public:
    explicit Table(std::int64_t entries) {
        fonts.ResetContents();
        for (std::int64_t i = 0; i < entries; ++i) {
            fonts.AddFontSubstitute(nameOf(L"file%05d.shx", i), nameOf(L"Face %05d", i), false,
                                    false, kAnsiCharset, 34, CMTextFontMapDatabase::MapTypeMisc, 0);
        }
    }
    ~Table() { fonts.ResetContents(); }
    Table(Table const&) = delete;
    Table& operator=(Table const&) = delete;

    CMTextFontMapDatabase fonts{0};
};

void floorOf(benchmark::State& state, wchar_t const* format) {
    std::map<CStdStrW, int> map;
    for (std::int64_t i = 0; i < state.range(0); ++i)
        map[nameOf(format, i)] = static_cast<int>(i);
    CStdStrW const key = nameOf(format, state.range(0) / 3);
    while (state.KeepRunning())
        benchmark::DoNotOptimize(map.find(key));
}

void fileToFont(benchmark::State& state) {
    Table table(state.range(0));
    CStdStrW const file = nameOf(L"file%05d.shx", state.range(0) / 3);
    auto type = CMTextFontMapDatabase::MapTypeSystem;
    bool bold = false;
    bool italic = false;
    Charset charset = kAnsiCharset;
    int pitch = 0;
    while (state.KeepRunning())
        benchmark::DoNotOptimize(
            table.fonts.MapFileToFont(type, file, bold, italic, charset, pitch));
}

void fontToFile(benchmark::State& state) {
    Table table(state.range(0));
    CStdStrW const face = nameOf(L"Face %05d", state.range(0) / 3);
    auto type = CMTextFontMapDatabase::MapTypeSystem;
    while (state.KeepRunning())
        benchmark::DoNotOptimize(
            table.fonts.MapFontToFile(type, face, false, false, kAnsiCharset, 34));
}

void entries(benchmark::internal::Benchmark* each) {
    each->Arg(10)->Arg(200)->Arg(2000);
}

BENCHMARK_CAPTURE(floorOf, files, L"file%05d.shx")->Apply(entries);
BENCHMARK(fileToFont)->Apply(entries);
BENCHMARK_CAPTURE(floorOf, faces, L"Face %05d|b0|i0|c0|p34")->Apply(entries);
BENCHMARK(fontToFile)->Apply(entries);

}  // namespace
