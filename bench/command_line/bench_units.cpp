// Lengths as text and back in each unit. The floor is what the C library takes for the same number;
// five times that is the most.
#include <benchmark/benchmark.h>

#include <cstdio>
#include <cstdlib>

#include "tz/ed/units.h"

namespace {

constexpr int kScientific = 1;
constexpr double kStep = 0.37;
constexpr wchar_t const* kTexts[] = {L"1.2345E+03", L"1234.5000", L"102'-10.5000\"",
                                     L"102'-10 1/2\"", L"1234 1/2"};

void writeByLibrary(benchmark::State& state) {
    char const* const format = state.range(0) == kScientific ? "%.4E" : "%.4f";
    char text[64];
    double value = 0.1;
    while (state.KeepRunning())
        benchmark::DoNotOptimize(std::snprintf(text, sizeof text, format, value += kStep));
}

void writeLength(benchmark::State& state) {
    TzString text;
    double value = 0.1;
    while (state.KeepRunning())
        benchmark::DoNotOptimize(
            tzdbRToS(value += kStep, static_cast<int>(state.range(0)), 4, text));
}

void readByLibrary(benchmark::State& state) {
    char const* const text = state.range(0) == kScientific ? "1.2345E+03" : "1234.5000";
    while (state.KeepRunning())
        benchmark::DoNotOptimize(std::strtod(text, nullptr));
}

void readLength(benchmark::State& state) {
    double value = 0;
    while (state.KeepRunning()) {
        benchmark::DoNotOptimize(tzdbDisToF(kTexts[state.range(0) - 1], 2, &value));
        benchmark::DoNotOptimize(value);
    }
}

BENCHMARK(writeByLibrary)->DenseRange(1, 5);
BENCHMARK(writeLength)->DenseRange(1, 5);
BENCHMARK(readByLibrary)->DenseRange(1, 5);
BENCHMARK(readLength)->DenseRange(1, 5);

}  // namespace
