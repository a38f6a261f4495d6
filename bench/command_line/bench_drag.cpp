// A drag of 100 cursor places over drawings of growing size: the time must not follow the size.
#include <benchmark/benchmark.h>

#include "host/command_line/command_line.h"
#include "host/command_line/script_source.h"
#include "host/database/drawing.h"
#include "tz/db/block_table.h"
#include "tz/db/shapes.h"
#include "tz/ed/jig.h"

namespace {

class RubberLine : public TzEdJig {
public:
    DragStatus sampler() override {
        TzGePoint3d point;
        DragStatus const status = acquirePoint(point);
        (void)line_.setEndPoint(point);
        return status;
    }
    bool update() override { return true; }
    [[nodiscard]] TzDbEntity* entity() const override { return &line_; }

private:
    mutable TzDbLine line_;
};

void fill(tzhost::Drawing& drawing, std::int64_t count) {
    TzDbBlockTableRecord* space = nullptr;
    if (tzdbOpenObject(space, drawing.modelSpace(), TzDb::kForWrite) != Tzad::eOk) return;
    for (std::int64_t i = 0; i < count; ++i) {
        auto* const line = new TzDbLine;
        TzDbObjectId id;
        if (space->appendTzDbEntity(id, line) == Tzad::eOk) line->close();
    }
    space->close();
}

void drag(benchmark::State& state) {
    auto const drawing = tzhost::Drawing::create();
    tzhost::setWorkingDrawing(drawing.get());
    fill(*drawing, state.range(0));
    std::string script;
    for (int i = 0; i < 100; ++i)
        script += "~" + std::to_string(i) + ",1\n";
    RubberLine jig;
    while (state.KeepRunning()) {
        tzhost::ScriptSource source(script + "\n");
        tzhost::commandLine().setSource(&source);
        benchmark::DoNotOptimize(jig.drag());
    }
    tzhost::commandLine().reset();
    tzhost::setWorkingDrawing(nullptr);
}

BENCHMARK(drag)->Arg(0)->Arg(1000)->Arg(100000)->Unit(benchmark::kMicrosecond);

}  // namespace
