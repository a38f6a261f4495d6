// Both converters over plain text and over text whose look changes every 40 characters, at growing
// sizes. The floor appends the same characters to a growing wide string: plain text may take four
// times as long, dense text twenty times. From size to size the time for a character stays within
// 1.3.
#include <benchmark/benchmark.h>

#include <string>

#include "module/markup/mtext_to_rtf.h"
#include "module/markup/rtf_to_mtext.h"
#include "module/markup/scale_correction.h"
#include "tz/mte/font_map_database.h"

namespace {

constexpr wchar_t kFace[] = L"Liberation Sans";
constexpr std::int64_t kLeast = 10 << 10;
constexpr std::int64_t kMost = 40 << 20;

enum class Text { plain, denseMarkup, denseRtf };

std::wstring textOf(Text kind, std::int64_t size) {
    struct Change {
        wchar_t const* markup;
        wchar_t const* rtf;
    };
    static constexpr Change kChanges[] = {
        {L"\\L",     L"\\ul "  },
        {L"\\l",     L"\\ul0 " },
        {L"\\H2x;",  L"\\fs56 "},
        {L"\\H.5x;", L"\\fs28 "},
        {L"\\O",     L"\\b "   },
        {L"\\o",     L"\\b0 "  },
    };
    std::wstring text;
    for (std::size_t i = 0; static_cast<std::int64_t>(text.size()) < size; ++i) {
        Change const& change = kChanges[i % std::size(kChanges)];
        if (kind == Text::denseMarkup) text += change.markup;
        if (kind == Text::denseRtf) text += change.rtf;
        text += L"a run of text that no code interrupts, it";
    }
    return text;
}

struct Session {
    Session() {
        for (CScaleCorrection* scale : {&fontScale, &marginScale}) {
            scale->SetScaleUnits(0.2);
            scale->SetScaleTwips(280);
        }
    }
    CMTextFontMapDatabase fonts{0};
    CScaleCorrection fontScale{1};
    CScaleCorrection marginScale{0};
};

void count(benchmark::State& state, std::wstring const& text) {
    state.SetItemsProcessed(state.iterations() * static_cast<std::int64_t>(text.size()));
}

void floorOf(benchmark::State& state, Text kind) {
    std::wstring const text = textOf(kind, state.range(0));
    while (state.KeepRunning()) {
        std::wstring copy;
        for (wchar_t const c : text)
            copy.push_back(c);
        benchmark::DoNotOptimize(copy.data());
    }
    count(state, text);
}

void toRtf(benchmark::State& state, Text kind) {
    std::wstring const text = textOf(kind, state.range(0));
    Session session;
    while (state.KeepRunning()) {
        CMTextToRichTextContext context(&session.fonts, &session.fontScale, &session.marginScale);
        context.SetInitialFontName(kFace, false, false, kAnsiCharset, 34);
        context.SetInitialFontSize(0.2, 280);
        context.SetInitialFontColor(0);
        benchmark::DoNotOptimize(context.Parse(text.c_str()));
    }
    count(state, text);
}

void toMtext(benchmark::State& state, Text kind) {
    std::wstring const text = textOf(kind, state.range(0));
    Session session;
    while (state.KeepRunning()) {
        CRichTextToMTextContext context(&session.fonts, &session.fontScale, &session.marginScale);
        context.SetInitialFontName(kFace, false, false, kAnsiCharset, 34);
        context.SetInitialFontSize(0.2, 280);
        context.SetInitialColor(0);
        benchmark::DoNotOptimize(context.Parse(text.c_str()));
    }
    count(state, text);
}

void sizes(benchmark::internal::Benchmark* each) {
    each->RangeMultiplier(16)->Range(kLeast, kMost)->Unit(benchmark::kMicrosecond);
}

BENCHMARK_CAPTURE(floorOf, plain, Text::plain)->Apply(sizes);
BENCHMARK_CAPTURE(toRtf, plain, Text::plain)->Apply(sizes);
BENCHMARK_CAPTURE(toMtext, plain, Text::plain)->Apply(sizes);
BENCHMARK_CAPTURE(toRtf, dense, Text::denseMarkup)->Apply(sizes);
BENCHMARK_CAPTURE(toMtext, dense, Text::denseRtf)->Apply(sizes);

}  // namespace
