// A drag of the text box over 100 cursor places, in a drawing with 100,000 entities. The floor is
// the same drag in a drawing with 10: a sample, which is an update and a redraw of the preview,
// must not follow the size of the drawing.
#include <benchmark/benchmark.h>

#include <string>

#include "bench/support/against_floor.h"
#include "bench/support/filled_drawing.h"
#include "host/command_line/command_line.h"
#include "host/command_line/script_source.h"
#include "module/mtext/rectangle_jig.h"
#include "module/prompt/jig_input.h"

namespace {

constexpr double kMost = 1.2;
constexpr int kSmall = 10;
constexpr int kLarge = 100000;
constexpr int kPlaces = 100;

std::string cursorPlaces() {
    std::string script;
    for (int i = 1; i <= kPlaces; ++i)
        script += "~" + std::to_string(i) + ",1\n";
    return script + "200,1\n";
}

int dragIn(tzhost::Drawing* drawing, std::string const& script) {
    tzhost::setWorkingDrawing(drawing);
    tzhost::ScriptSource source(script);
    tzhost::commandLine().setSource(&source);
    CTzsMtextJig preview(TzGePoint3d::kOrigin);
    CKeywordTable none;
    CTzsJigInput input(TzEdJig::kGovernedByOrthoMode, none, &preview, TzString(L"Corner"));
    int const status = input.Prompt();
    tzhost::commandLine().setSource(nullptr);
    return status;
}

void dragBox(benchmark::State& state) {
    auto const small = tzbench::drawingWith(kSmall);
    auto const large = tzbench::drawingWith(kLarge);
    std::string const script = cursorPlaces();
    if (dragIn(large.get(), script) != statusNormal) state.SkipWithError("the drag was refused");
    tzbench::AgainstFloor against(state, kMost);
    while (state.KeepRunning())
        against.turn([&] { return dragIn(large.get(), script); },
                     [&] { return dragIn(small.get(), script); });
    tzhost::commandLine().reset();
    tzhost::setWorkingDrawing(nullptr);
}
BENCHMARK(dragBox)->UseManualTime()->Unit(benchmark::kMicrosecond);

}  // namespace
