// Laying out MTEXT of growing length. What is read is the time for a character, which must not grow
// with the length; the floor is reading the markup alone.
#include <benchmark/benchmark.h>

#include <cstddef>
#include <string>

#include "host/layout/markup_reader.h"
#include "host/layout/mtext_layout.h"

namespace {

constexpr wchar_t const* kParts[] = {L"plain words and ", L"{\\C1;a}\\Lb\\l \\S1/2;\\P"};

std::wstring textOf(benchmark::State const& state) {
    std::wstring const part = kParts[state.range(0)];
    auto const length = static_cast<std::size_t>(state.range(1));
    std::wstring text;
    while (text.size() < length)
        text += part;
    return text;
}

void countCharacters(benchmark::State& state, std::size_t length) {
    state.SetItemsProcessed(state.iterations() * static_cast<std::int64_t>(length));
}

void readMarkupAlone(benchmark::State& state) {
    std::wstring const text = textOf(state);
    while (state.KeepRunning()) {
        benchmark::DoNotOptimize(tzhost::readMarkup(text, {0, 1.0, {}, false, false}));
    }
    countCharacters(state, text.size());
}

void layOut(benchmark::State& state) {
    tzhost::MTextLayoutInput input;
    input.contents = textOf(state);
    input.width = 50.0;
    input.textHeight = 1.0;
    while (state.KeepRunning()) {
        benchmark::DoNotOptimize(tzhost::layOutMText(input));
    }
    countCharacters(state, input.contents.size());
}

BENCHMARK(readMarkupAlone)
    ->ArgsProduct({
        {0,      1      },
        { 100, 10000, 1000000}
});
BENCHMARK(layOut)
    ->ArgsProduct({
        {0,      1      },
        { 100, 10000, 1000000}
})
    ->Unit(benchmark::kMicrosecond);

}  // namespace
