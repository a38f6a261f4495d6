#include "bench/support/filled_drawing.h"

#include "tz/db/block_table.h"
#include "tz/db/mtext.h"
#include "tz/db/shapes.h"

namespace tzbench {
namespace {

TzGePoint3d placeOf(int index) {
    return {static_cast<double>(index % 100), static_cast<double>(index / 100), 0};
}

std::unique_ptr<TzDbEntity> lineAt(TzGePoint3d const& place) {
    auto line = std::make_unique<TzDbLine>();
    (void)line->setStartPoint(place);
    (void)line->setEndPoint(place + TzGeVector3d::kXAxis);
    return line;
}

std::unique_ptr<TzDbEntity> textAt(TzGePoint3d const& place) {
    auto text = std::make_unique<TzDbMText>();
    text->setDatabaseDefaults();
    (void)text->setLocation(place);
    (void)text->setContents(L"A note");
    return text;
}

using MakeEntity = std::unique_ptr<TzDbEntity> (*)(TzGePoint3d const& place);

// With `even` and `odd` in turns.
std::unique_ptr<tzhost::Drawing> drawingOf(int count, MakeEntity even, MakeEntity odd) {
    auto drawing = tzhost::Drawing::create();
    tzhost::setWorkingDrawing(drawing.get());
    TzDbBlockTableRecord* space = nullptr;
    if (tzdbOpenObject(space, drawing->modelSpace(), TzDb::kForWrite) != Tzad::eOk) return drawing;
    for (int i = 0; i < count; ++i) {
        auto entity = (i % 2 == 0 ? even : odd)(placeOf(i));
        TzDbObjectId id;
        // What is closed is closed in any case.
        if (space->appendTzDbEntity(id, entity.get()) == Tzad::eOk) (void)entity.release()->close();
    }
    (void)space->close();
    return drawing;
}

}  // namespace

std::unique_ptr<tzhost::Drawing> drawingWith(int count) {
    return drawingOf(count, lineAt, textAt);
}

std::unique_ptr<tzhost::Drawing> drawingWithTexts(int count) {
    return drawingOf(count, textAt, textAt);
}

}  // namespace tzbench
