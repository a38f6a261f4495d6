// Texts that another holder has open while a command runs: they are passed over, and the others are
// changed.

#include <gtest/gtest.h>

#include "host/selection/entity_list.h"
#include "module/host_calls/space_posting.h"
#include "module/shell/callbacks.h"
#include "tests/mtext/held_text.h"
#include "tz/db/mtext.h"
#include "tz/mte/easy_object.h"

namespace {

struct HolderRow {
    char const* name;
    void (*command)();
    char const* script;
    bool isLayerLocked;  // of both texts
    TzDb::OpenMode held;
    wchar_t const* shown;  // of the transcript
    double height;         // of the other text; the held one keeps 2
    double rotation;       // of the other text; the held one keeps 0
};

// Enter at a selection prompt ends it.
constexpr HolderRow kHolders[] = {
    {"EditRead", EditMtextCallback, "<<<\nx\n>>>\n", false, TzDb::kForRead,
     L"cannot be opened for writing", 2, 0},
    {"EditWritten", EditMtextCallback, "<<<\nx\n>>>\n", false, TzDb::kForWrite,
     L"no multi-line text", 2, 0},
    {"HeightRead", CompatibleEditMtextCallback, "all\n\n5\n", false, TzDb::kForRead, L"text height",
     5, 0},
    {"HeightWritten", CompatibleEditMtextCallback, "all\n\n5\n", false, TzDb::kForWrite,
     L"text height", 5, 0},
    {"PropertiesRead", MtextPropertiesCallback, "R\n57.29577951308232\n", false, TzDb::kForRead,
     L"2 found", 2, 1},
    {"PropertiesWritten", MtextPropertiesCallback, "R\n57.29577951308232\n", false, TzDb::kForWrite,
     L"2 found", 2, 1},
    // Of the two on a locked layer the held one does not count, and stays in the set.
    {"PropertiesLocked", MtextPropertiesCallback, "R\n57.29577951308232\n", true, TzDb::kForRead,
     L"2 found. 1 of them was", 2, 0},
};

TzDbObjectId postText() {
    auto* const text = new TzDbMText;
    text->setDatabaseDefaults();
    EXPECT_EQ(text->setTextHeight(2), Tzad::eOk);
    TzDbObjectId id;
    EXPECT_EQ(postToDb(text, id, false), Tzad::eOk);
    return id;
}

void lockLayers() {
    EasyObject<TzDbLayerTableRecord> layer;
    ASSERT_EQ(tzdbOpenObject(layer.object, tzhost::workingDrawing()->clayer(), TzDb::kForWrite),
              Tzad::eOk);
    EXPECT_EQ(layer->setIsLocked(true), Tzad::eOk);
}

class Holders : public testing::TestWithParam<HolderRow> {};
TEST_P(Holders, ArePassedOver) {
    HolderRow const& row = GetParam();
    OpenDrawing const drawing(row.script);
    TzDbObjectId const ids[] = {postText(), postText()};
    EasyObject<TzDbMText> held;
    if (row.held == TzDb::kForRead && row.isLayerLocked) lockLayers();
    ASSERT_EQ(tzdbOpenObject(held.object, ids[0], row.held), Tzad::eOk);
    tzhost::setImpliedSelection({ids[0], ids[1]});

    row.command();
    tzhost::dropImpliedSelection();
    EXPECT_EQ(held->close(), Tzad::eOk);
    held.object = nullptr;
    EXPECT_NE(drawing.transcript().find(row.shown), std::wstring::npos) << drawing.events();
    for (int index = 0; index < 2; ++index) {
        EasyObject<TzDbMText> text;
        ASSERT_EQ(tzdbOpenObject(text.object, ids[index], TzDb::kForRead), Tzad::eOk);
        EXPECT_EQ(text->textHeight(), index == 0 ? 2 : row.height);
        EXPECT_NEAR(text->rotation(), index == 0 ? 0 : row.rotation, 1e-9);
    }
}
INSTANTIATE_TEST_SUITE_P(Commands, Holders, testing::ValuesIn(kHolders), [](auto const& row) {
    return row.param.name;
});

}  // namespace
