#include "tests/database/drawing_fixture.h"

#include "host/base/audit.h"
#include "host/database/classes.h"
#include "host/database/open_state.h"

namespace tzhost::test {

DrawingFixture::DrawingFixture() {
    Variables::instance().resetKept(KeptIn::drawing);
    setWorkingDrawing(drawing.get());
}

DrawingFixture::~DrawingFixture() {
    EXPECT_TRUE(audit().clean()) << "left open: " << audit().openObjects;
    setWorkingDrawing(nullptr);
}

TzDbObjectId DrawingFixture::add(TzDbEntity* entity) {
    TzDbBlockTableRecord* space = nullptr;
    EXPECT_EQ(tzdbOpenObject(space, drawing->modelSpace(), TzDb::kForWrite), Tzad::eOk);
    TzDbObjectId id;
    EXPECT_EQ(space->appendTzDbEntity(id, entity), Tzad::eOk);
    EXPECT_EQ(space->close(), Tzad::eOk);
    EXPECT_EQ(entity->close(), Tzad::eOk);
    return id;
}

TzDbObjectId DrawingFixture::addText(wchar_t const* contents) {
    auto* const text = new TzDbMText;
    text->setDatabaseDefaults(drawing.get());
    EXPECT_EQ(text->setContents(contents), Tzad::eOk);
    return add(text);
}

TzDbObjectId DrawingFixture::addLayer(wchar_t const* name) {
    TzDbLayerTable* table = nullptr;
    EXPECT_EQ(drawing->getLayerTable(table, TzDb::kForWrite), Tzad::eOk);
    auto* const record = new TzDbLayerTableRecord;
    EXPECT_EQ(record->setName(name), Tzad::eOk);
    TzDbObjectId id;
    EXPECT_EQ(table->addRecord(record, id), Tzad::eOk);
    EXPECT_EQ(record->close(), Tzad::eOk);
    EXPECT_EQ(table->close(), Tzad::eOk);
    return id;
}

TzDbObjectId DrawingFixture::addStyle(wchar_t const* name, wchar_t const* typeface) {
    TzDbTextStyleTable* table = nullptr;
    EXPECT_EQ(drawing->getTextStyleTable(table, TzDb::kForWrite), Tzad::eOk);
    auto* const record = new TzDbTextStyleTableRecord;
    EXPECT_EQ(record->setName(name), Tzad::eOk);
    EXPECT_EQ(record->setFont(typeface, false, false, 0, 0), Tzad::eOk);
    TzDbObjectId id;
    EXPECT_EQ(table->addRecord(record, id), Tzad::eOk);
    EXPECT_EQ(record->close(), Tzad::eOk);
    EXPECT_EQ(table->close(), Tzad::eOk);
    return id;
}

void DrawingFixture::lock(TzDbObjectId layer, bool locked) {
    TzDbLayerTableRecord* record = nullptr;
    ASSERT_EQ(tzdbOpenObject(record, layer, TzDb::kForWrite), Tzad::eOk);
    EXPECT_EQ(record->setIsLocked(locked), Tzad::eOk);
    EXPECT_EQ(record->close(), Tzad::eOk);
}

std::string DrawingFixture::list() const {
    TzArray<TzDbObjectId> ids;
    at<TzDbBlockTableRecord>(drawing->modelSpace()).entities(ids);
    std::string text;
    for (TzDbObjectId const id : ids) {
        if (!text.empty()) text += '|';
        auto const& entity = at<TzDbEntity>(id);
        text += handleText(id.handle()).toUtf8() + ' ' + entityKind(entity.isA()).toUtf8() + ' ' +
                entity.layer().toUtf8();
    }
    return text;
}

}  // namespace tzhost::test
