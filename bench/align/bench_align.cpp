// An alignment of many texts. One place of the cursor stands beside a sort of as many numbers; a
// whole run stands beside runs with fewer texts, and one with as many planes or directions as texts
// beside one with a single plane and direction.
#include <benchmark/benchmark.h>

#include <algorithm>
#include <cmath>
#include <memory>
#include <random>
#include <vector>

#include "bench/support/against_floor.h"
#include "host/database/drawing.h"
#include "host/selection/selection_sets.h"
#include "module/align/manipulator.h"
#include "module/align/spacing/even_spacing.h"
#include "tz/db/block_table.h"
#include "tz/db/mtext.h"
#include "tz/ed/selection.h"

namespace {

constexpr int kMany = 100000;
constexpr int kTenth = kMany / 10;

// A drawing with texts at scattered places, in turns on parallel planes and in directions that fill
// a quarter of a turn.
class Texts {
public:
    Texts(int count, int planes, int directions) : drawing_(tzhost::Drawing::create()) {
        tzhost::setWorkingDrawing(drawing_.get());
        TzDbBlockTableRecord* space = nullptr;
        if (tzdbOpenObject(space, drawing_->modelSpace(), TzDb::kForWrite) != Tzad::eOk) return;
        std::mt19937 random(1);
        std::uniform_real_distribution<double> place(0, 1000);
        for (int i = 0; i < count; ++i) {
            auto* const text = new TzDbMText;
            text->setDatabaseDefaults();
            (void)text->setLocation({place(random), place(random), double(i % planes)});
            double const angle = 1.5 * (i % directions) / directions;
            (void)text->setDirection({std::cos(angle), std::sin(angle), 0});
            (void)text->setContents(L"A note");
            TzDbObjectId id;
            (void)space->appendTzDbEntity(id, text);
            (void)text->close();
            ids_.append(id);
        }
        (void)space->close();
    }
    Texts(Texts const&) = delete;
    Texts& operator=(Texts const&) = delete;
    ~Texts() { tzhost::setWorkingDrawing(nullptr); }

    // A manipulator that holds them, ready to be dragged.
    [[nodiscard]] std::unique_ptr<TzMTextAlignManipulator> taken() const {
        tzhost::setWorkingDrawing(drawing_.get());
        auto manipulator = std::make_unique<TzMTextAlignManipulator>();
        manipulator->registerAlignOption(new TzMTextAlignOptionDistribute);
        manipulator->loadDefaultSettings();
        long long set[2] = {};
        tzhost::nameNewSet(ids_, set);
        (void)manipulator->insertTexts(set);
        tzedSSFree(set);
        manipulator->addText();
        manipulator->setFirstPoint({});
        manipulator->prepareForDragging();
        return manipulator;
    }
    // A whole run, from the selection to the moved texts.
    int aligned() const {
        auto const manipulator = taken();
        dragTo(*manipulator, 1);
        manipulator->updateDb();
        return manipulator->texts().length();
    }
    // The cursor at another place for each turn.
    static int dragTo(TzMTextAlignManipulator& manipulator, int turn) {
        manipulator.setSecondPoint({1000 * std::cos(turn), 1000 * std::sin(turn), 0});
        manipulator.alignEntities();
        return turn;
    }

private:
    std::unique_ptr<tzhost::Drawing> drawing_;
    tzhost::EntityIds ids_;
};

void onePlaceOfTheCursor(benchmark::State& state) {
    Texts const texts(kMany, 1, 1);
    auto const manipulator = texts.taken();
    std::vector<double> numbers(kMany);
    std::mt19937 random(2);
    std::generate(numbers.begin(), numbers.end(), [&random] { return double(random()); });
    int turn = 0;
    tzbench::AgainstFloor against(state, 20);
    while (state.KeepRunning())
        against.turn([&] { return Texts::dragTo(*manipulator, ++turn); },
                     [&] {
                         std::vector<double> sorted = numbers;
                         std::sort(sorted.begin(), sorted.end());
                         return sorted;
                     });
}
BENCHMARK(onePlaceOfTheCursor)->UseManualTime()->Unit(benchmark::kMillisecond);

void manyTextsOnTenPlanes(benchmark::State& state) {
    Texts const many(kMany, 10, 10);
    Texts const few(kTenth, 10, 10);
    tzbench::AgainstFloor against(state, 1.5);
    while (state.KeepRunning())
        against.turn([&] { return many.aligned(); },
                     [&] {
                         for (int i = 1; i < kMany / kTenth; ++i)
                             (void)few.aligned();
                         return few.aligned();
                     });
}
BENCHMARK(manyTextsOnTenPlanes)->UseManualTime()->Unit(benchmark::kMillisecond);

void asManyPlanesAsTexts(benchmark::State& state) {
    Texts const apart(kTenth, kTenth, 1);
    Texts const together(kTenth, 1, 1);
    tzbench::AgainstFloor against(state, 200);
    while (state.KeepRunning())
        against.turn([&] { return apart.aligned(); }, [&] { return together.aligned(); });
}
BENCHMARK(asManyPlanesAsTexts)->UseManualTime()->Unit(benchmark::kMillisecond);

void asManyDirectionsAsTexts(benchmark::State& state) {
    Texts const apart(kTenth, 1, kTenth);
    Texts const together(kTenth, 1, 1);
    tzbench::AgainstFloor against(state, 200);
    while (state.KeepRunning())
        against.turn([&] { return apart.aligned(); }, [&] { return together.aligned(); });
}
BENCHMARK(asManyDirectionsAsTexts)->UseManualTime()->Unit(benchmark::kMillisecond);

}  // namespace
