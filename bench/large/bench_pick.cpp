// Picks in a drawing of 100,000 entities, at the top and in a block, and small crossings, once
// their index is built. The floor are the same in a drawing of 100.
#include <benchmark/benchmark.h>

#include "bench/support/against_floor.h"
#include "bench/support/filled_drawing.h"
#include "host/selection/pick.h"
#include "host/selection/selection_words.h"
#include "tz/db/block_table.h"
#include "tz/db/shapes.h"

namespace {

constexpr double kMost = 3.0;
constexpr int kFew = 100;
constexpr int kMany = 100000;
constexpr int kPicks = 200;

template <tzhost::Depth kDepth>
bool pick(double x) {
    return tzhost::pickAt({x, 0, 0}, kDepth).has_value();
}

bool cross(double x) {
    return !tzhost::entitiesIn({{x, 0}, {x + 1, 1}}, tzhost::Touch::crossing).isEmpty();
}

// How many of the questions all over the first row hit something.
int askAll(tzhost::Drawing* drawing, bool (*ask)(double x)) {
    tzhost::setWorkingDrawing(drawing);
    int hits = 0;
    for (int i = 0; i < kPicks; ++i)
        hits += ask(i % 50 * 2 + 0.5) ? 1 : 0;
    return hits;
}

// A reference to a block with so many lines.
std::unique_ptr<tzhost::Drawing> drawingWithBlock(int count) {
    auto drawing = tzhost::Drawing::create();
    tzhost::setWorkingDrawing(drawing.get());
    TzDbBlockTable* table = nullptr;
    auto* const block = new TzDbBlockTableRecord;
    TzDbObjectId id;
    if (drawing->getBlockTable(table, TzDb::kForWrite) != Tzad::eOk ||
        block->setName(L"B") != Tzad::eOk || table->addRecord(block, id) != Tzad::eOk) {
        return drawing;  // the picks miss
    }
    (void)table->close();
    TzDbObjectId ignored;
    for (int i = 0; i < count; ++i) {
        TzGePoint3d const start(i % 100, i / 100, 0);
        auto* const line = new TzDbLine;
        (void)line->setStartPoint(start);
        (void)line->setEndPoint(start + TzGeVector3d::kXAxis);
        if (block->appendTzDbEntity(ignored, line) == Tzad::eOk) (void)line->close();
    }
    (void)block->close();
    TzDbBlockTableRecord* space = nullptr;
    if (tzdbOpenObject(space, drawing->modelSpace(), TzDb::kForWrite) != Tzad::eOk) return drawing;
    auto* const reference = new TzDbBlockReference;
    (void)reference->setBlockTableRecord(id);
    if (space->appendTzDbEntity(ignored, reference) == Tzad::eOk) (void)reference->close();
    (void)space->close();
    return drawing;
}

void pickIn(benchmark::State& state,
            std::unique_ptr<tzhost::Drawing> (*drawingOf)(int),
            bool (*ask)(double x)) {
    auto const few = drawingOf(kFew);
    auto const many = drawingOf(kMany);
    constexpr int kUntilBuilt = 2;
    for (int i = 0; i < kUntilBuilt; ++i) {
        if (askAll(few.get(), ask) != kPicks || askAll(many.get(), ask) != kPicks)
            state.SkipWithError("a pick misses");
    }
    tzbench::AgainstFloor against(state, kMost);
    while (state.KeepRunning())
        against.turn([&] { return askAll(many.get(), ask); },
                     [&] { return askAll(few.get(), ask); });
    tzhost::setWorkingDrawing(nullptr);
}
BENCHMARK_CAPTURE(pickIn, top, tzbench::drawingWith, pick<tzhost::Depth::top>)
    ->UseManualTime()
    ->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(pickIn, nested, drawingWithBlock, pick<tzhost::Depth::nested>)
    ->UseManualTime()
    ->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(pickIn, crossing, tzbench::drawingWith, cross)
    ->UseManualTime()
    ->Unit(benchmark::kMillisecond);

}  // namespace
