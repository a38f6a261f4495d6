// The normaliser beside the module's reader on the same document, of which it may take four times
// the time, and a large document beside small ones of the same length together: the time for a byte
// must not grow.
#include <benchmark/benchmark.h>

#include <cstddef>
#include <string>

#include "bench/markup/texts.h"
#include "bench/support/against_floor.h"
#include "host/rtf/normaliser.h"
#include "host/text/utf8.h"

namespace {

constexpr double kMostOfReader = 4;
constexpr double kMostGrowth = 1.3;
constexpr std::size_t kLarge = 10000000;
constexpr std::size_t kSmall = 10000;

// As the tests' documents have it: plain text, a change of the look every 40 characters, and what a
// word processor makes of a paragraph.
constexpr char const* kUnits[] = {
    "a run of text that no code interrupts, it ",
    "a run of text that no code interrupts, it\\ul a run of text that no code interrupts, it\\ul0 "
    "a run of text that no code interrupts, it\\fs56 a run of text that no code interrupts, it\\fs28 "
    "a run of text that no code interrupts, it\\b a run of text that no code interrupts, it\\b0 ",
    "\\pard\\plain \\s19\\loch\\sl276\\slmult1\\sb0\\sa140\\ql\\li567\\ri0\\fi-283\\ltrpar{\\loch\n"
    "Lay }{\\loch\\b\\loch\nall drains}{\\loch\n before the slab, 110 \\u177\\'b1 2 mm, as sheet 12 "
    "shows; sand bed, 150 mm thick.}\n\\par ",
};

std::string documentOf(char const* unit, std::size_t size) {
    std::string text = "{\\rtf1\\ansi{\\fonttbl{\\f0\\fswiss\\fcharset0 Arial;}}\\fs28 ";
    text.reserve(size + 400);
    while (text.size() < size)
        text += unit;
    return text += "}";
}

void besideTheReader(benchmark::State& state) {
    std::string const rtf = documentOf(kUnits[state.range(0)], kLarge);
    std::wstring const wide = tzhost::fromUtf8(rtf);
    ConversionSession session(tzbench::startOfTexts());
    tzbench::AgainstFloor against(state, kMostOfReader);
    while (state.KeepRunning()) {
        against.turn([&] { return tzhost::normaliseRtf(rtf); },
                     [&] { return tzbench::converted(session, tzbench::Way::toMtext, wide); });
    }
}

void besideSmallDocuments(benchmark::State& state) {
    std::string const large = documentOf(kUnits[state.range(0)], kLarge);
    std::string const small = documentOf(kUnits[state.range(0)], kSmall);
    tzbench::AgainstFloor against(state, kMostGrowth);
    while (state.KeepRunning()) {
        against.turn([&] { return tzhost::normaliseRtf(large); },
                     [&] {
                         for (std::size_t i = 1; i < kLarge / kSmall; ++i)
                             benchmark::DoNotOptimize(tzhost::normaliseRtf(small));
                         return tzhost::normaliseRtf(small);
                     });
    }
}

BENCHMARK(besideTheReader)->DenseRange(0, 2)->UseManualTime()->Unit(benchmark::kMillisecond);
BENCHMARK(besideSmallDocuments)->DenseRange(0, 2)->UseManualTime()->Unit(benchmark::kMillisecond);

}  // namespace
