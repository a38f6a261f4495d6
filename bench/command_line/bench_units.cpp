// Lengths as text and back in each unit. The floor is what the C library takes for the same number.
#include <benchmark/benchmark.h>

#include <cstdio>
#include <cstdlib>

#include "bench/support/against_floor.h"
#include "tz/ed/units.h"
#include "tz/rx/status.h"

namespace {

constexpr double kMost = 5.0;
constexpr int kCalls = 1000;
constexpr int kPrecision = 4;
constexpr double kStep = 0.37;

// The linear units from 1, with the number 1234.5 as each writes it.
struct Unit {
    char const* name;
    char const* floorFormat;
    char const* floorText;
    wchar_t const* text;
};
constexpr Unit kUnits[] = {
    {"scientific", "%.4E", "1.2345E+03", L"1.2345E+03"},
    {"decimal", "%.4f", "1234.5000", L"1234.5000"},
    {"feetDecimals", "%.4f", "1234.5000", L"102'-10.5000\""},
    {"feetFractions", "%.4f", "1234.5000", L"102'-10 1/2\""},
    {"fractions", "%.4f", "1234.5000", L"1234 1/2"},
};

void writeLength(benchmark::State& state) {
    auto const unit = static_cast<int>(state.range(0));
    Unit const& row = kUnits[unit - 1];
    state.SetLabel(row.name);
    TzString text;
    char digits[64];
    double ours = 0.1;
    double theirs = 0.1;
    tzbench::AgainstFloor against(state, kMost, kCalls);
    while (state.KeepRunning())
        against.turn(
            [&] { return tzdbRToS(ours += kStep, unit, kPrecision, text); },
            [&] { return std::snprintf(digits, sizeof digits, row.floorFormat, theirs += kStep); });
}

void readLength(benchmark::State& state) {
    auto const unit = static_cast<int>(state.range(0));
    Unit const& row = kUnits[unit - 1];
    state.SetLabel(row.name);
    double value = 0;
    tzbench::AgainstFloor against(state, kMost, kCalls);
    while (state.KeepRunning())
        against.turn(
            [&] {
                if (tzdbDisToF(row.text, unit, &value) != Tzad::ePromptNormal)
                    state.SkipWithError("a length is not read");
                return value;
            },
            [&] { return std::strtod(row.floorText, nullptr); });
}

BENCHMARK(writeLength)->DenseRange(1, 5)->UseManualTime();
BENCHMARK(readLength)->DenseRange(1, 5)->UseManualTime();

}  // namespace
