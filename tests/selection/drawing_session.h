#pragma once

#include <memory>
#include <string>

#include "host/base/audit.h"
#include "host/database/drawing.h"
#include "host/runtime/documents.h"
#include "tests/command_line/scripted_session.h"
#include "tz/db/block_table.h"
#include "tz/db/mtext.h"
#include "tz/db/shapes.h"
#include "tz/db/text.h"
#include "tz/ed/selection.h"
#include "tz/rx/status.h"

namespace tzhost::test {

// An open document with a drawing that can be filled, and the names of its entities in tests: their
// handles, in capitals.
class OpenDrawing {
public:
    OpenDrawing() : drawing_(Drawing::create()) {
        setWorkingDrawing(drawing_.get());
        documents().open(drawing_.get());
    }
    OpenDrawing(OpenDrawing const&) = delete;
    OpenDrawing& operator=(OpenDrawing const&) = delete;
    ~OpenDrawing() {
        documents().close();
        setWorkingDrawing(nullptr);
    }

    // Adds an entity to a block; its handle, "0" when the block is not there.
    std::string add(TzDbEntity* entity, wchar_t const* block = kModelSpaceName) {
        std::unique_ptr<TzDbEntity> owned(entity);
        TzDbBlockTable* table = nullptr;
        TzDbBlockTableRecord* record = nullptr;
        TzDbObjectId id;
        if (drawing_->getBlockTable(table, TzDb::kForRead) != Tzad::eOk) return "no table";
        if (table->getAt(block, record, TzDb::kForWrite) == Tzad::eOk) {
            if (record->appendTzDbEntity(id, entity) == Tzad::eOk) {
                EXPECT_EQ(owned.release()->close(), Tzad::eOk);
            }
            EXPECT_EQ(record->close(), Tzad::eOk);
        }
        EXPECT_EQ(table->close(), Tzad::eOk);
        return handle(id);
    }
    std::string addLine(TzGePoint3d const& from,
                        TzGePoint3d const& to,
                        wchar_t const* block = kModelSpaceName) {
        auto* const line = new TzDbLine;
        line->setDatabaseDefaults();
        EXPECT_EQ(line->setStartPoint(from), Tzad::eOk);
        EXPECT_EQ(line->setEndPoint(to), Tzad::eOk);
        return add(line, block);
    }
    std::string addText(TzGePoint3d const& at, wchar_t const* contents, double degrees = 0) {
        auto* const text = new TzDbMText;
        text->setDatabaseDefaults();
        EXPECT_EQ(text->setLocation(at), Tzad::eOk);
        EXPECT_EQ(text->setTextHeight(1), Tzad::eOk);
        EXPECT_EQ(text->setContents(contents), Tzad::eOk);
        EXPECT_EQ(text->setRotation(degrees * 3.14159265358979323846 / 180), Tzad::eOk);
        return add(text);
    }
    // An empty block.
    TzDbObjectId addBlock(wchar_t const* name) {
        TzDbBlockTable* table = nullptr;
        TzDbObjectId id;
        auto* const record = new TzDbBlockTableRecord;
        EXPECT_EQ(record->setName(name), Tzad::eOk);
        if (drawing_->getBlockTable(table, TzDb::kForWrite) != Tzad::eOk) return id;
        if (table->addRecord(record, id) == Tzad::eOk) {
            EXPECT_EQ(record->close(), Tzad::eOk);
        }
        EXPECT_EQ(table->close(), Tzad::eOk);
        return id;
    }
    std::string addLayer(wchar_t const* name, bool isLocked) {
        TzDbLayerTable* table = nullptr;
        TzDbObjectId id;
        auto* const record = new TzDbLayerTableRecord;
        EXPECT_EQ(record->setName(name), Tzad::eOk);
        EXPECT_EQ(record->setIsLocked(isLocked), Tzad::eOk);
        if (drawing_->getLayerTable(table, TzDb::kForWrite) != Tzad::eOk) return "no table";
        if (table->addRecord(record, id) == Tzad::eOk) {
            EXPECT_EQ(record->close(), Tzad::eOk);
        }
        EXPECT_EQ(table->close(), Tzad::eOk);
        return handle(id);
    }

    [[nodiscard]] static std::string handle(TzDbObjectId id) {
        return TzString::formatted(L"%llX", static_cast<unsigned long long>(id.handle())).toUtf8();
    }
    [[nodiscard]] static std::string handleOf(long long const* name) {
        TzDbObjectId id;
        return tzdbGetObjectId(id, name) == Tzad::eOk ? handle(id) : "none";
    }
    [[nodiscard]] TzDbObjectId id(std::string const& handle) const {
        return drawing_->objectAt(std::stoull(handle, nullptr, 16));
    }
    [[nodiscard]] Drawing& drawing() const { return *drawing_; }

private:
    std::unique_ptr<Drawing> drawing_;
};

// The handles of a set, apart by blanks, or "none" for a set that is not there.
[[nodiscard]] inline std::string handlesOf(long long const* set) {
    int length = 0;
    if (tzedSSLength(set, &length) != Tzad::ePromptNormal) return "none";
    std::string all;
    for (int i = 0; i < length; ++i) {
        long long name[2] = {};
        if (tzedSSName(set, i, name) != Tzad::ePromptNormal) return "broken";
        all += (i > 0 ? " " : "") + OpenDrawing::handleOf(name);
    }
    return all;
}

}  // namespace tzhost::test
