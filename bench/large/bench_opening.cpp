// Opening a drawing of 100,000 texts. The floor runs the careful JSON parser, which reads settings
// and judges what is wrong with a drawing, over the same bytes and throws its events away.
#include <benchmark/benchmark.h>

#include <filesystem>
#include <string>

#include <nlohmann/json.hpp>

#include "bench/support/against_floor.h"
#include "bench/support/filled_drawing.h"
#include "host/drawing_file/drawing_file.h"
#include "host/files/file_bytes.h"

namespace {

constexpr double kMost = 1.2;
constexpr int kTexts = 100000;

void openTexts(benchmark::State& state) {
    auto const file = std::filesystem::current_path() / "opening.json";
    auto const drawing = tzbench::drawingWithTexts(kTexts);
    std::string const error = tzhost::writeDrawing(*drawing, file);
    if (!error.empty()) state.SkipWithError(error.c_str());
    tzhost::setWorkingDrawing(nullptr);
    auto const bytes = tzhost::readFile(file.string()).value_or("");
    tzbench::AgainstFloor against(state, kMost);
    while (state.KeepRunning())
        against.turn([&] { return tzhost::readDrawing(file); },
                     [&] { return nlohmann::json::accept(bytes); });
    std::filesystem::remove(file);
}
BENCHMARK(openTexts)->UseManualTime()->Unit(benchmark::kMillisecond);

}  // namespace
