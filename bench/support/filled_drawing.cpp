#include "bench/support/filled_drawing.h"

#include "tz/db/block_table.h"
#include "tz/db/mtext.h"
#include "tz/db/shapes.h"

namespace tzbench {
namespace {

std::unique_ptr<TzDbEntity> entityAt(int index) {
    TzGePoint3d const place(index % 100, index / 100, 0);
    if (index % 2 == 0) {
        auto line = std::make_unique<TzDbLine>();
        (void)line->setStartPoint(place);
        (void)line->setEndPoint(place + TzGeVector3d::kXAxis);
        return line;
    }
    auto text = std::make_unique<TzDbMText>();
    text->setDatabaseDefaults();
    (void)text->setLocation(place);
    (void)text->setContents(L"A note");
    return text;
}

}  // namespace

std::unique_ptr<tzhost::Drawing> drawingWith(int count) {
    auto drawing = tzhost::Drawing::create();
    tzhost::setWorkingDrawing(drawing.get());
    TzDbBlockTableRecord* space = nullptr;
    if (tzdbOpenObject(space, drawing->modelSpace(), TzDb::kForWrite) != Tzad::eOk) return drawing;
    for (int i = 0; i < count; ++i) {
        auto entity = entityAt(i);
        TzDbObjectId id;
        // What is closed is closed in any case.
        if (space->appendTzDbEntity(id, entity.get()) == Tzad::eOk) (void)entity.release()->close();
    }
    (void)space->close();
    return drawing;
}

}  // namespace tzbench
