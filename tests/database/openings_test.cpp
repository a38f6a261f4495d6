#include <array>

#include "host/base/audit.h"
#include "host/base/event_sink.h"
#include "host/base/fault_point.h"
#include "tests/database/drawing_fixture.h"

using tzhost::test::DrawingFixture;
using tzhost::test::DrawingTest;

namespace {

// A walk on one text: R and W open it for read and for write, u upgrades, d downgrades, c closes,
// l locks its layer, e erases it. Each step gives a status; `open` counts what is open after
// the walk.
struct Walk {
    char const* name;
    char const* steps;
    std::vector<int> statuses;
    int open;
};

Walk const kWalks[] = {
    {"ReadTwice", "RRcc", {0, 0, 0, 0}, 0},
    {"WriteBlocksRead", "WRc", {0, 45, 0}, 0},
    {"WriteBlocksWrite", "WWc", {0, 83, 0}, 0},
    {"ReadBlocksWrite", "RWc", {0, 15, 0}, 0},
    {"Upgrade", "Rudcc", {0, 0, 0, 0, 1010}, 0},
    {"UpgradeOfTwo", "RRuccu", {0, 0, 15, 0, 0, 1010}, 0},
    {"UpgradeTwice", "Ruuc", {0, 0, 83, 0}, 0},
    {"UpgradeOfWriter", "Wuc", {0, 83, 0}, 0},
    {"UpgradeOfClosed", "u", {1010}, 0},
    {"DowngradeOfReader", "Rdc", {0, 1011, 0}, 0},
    {"DowngradeLetsRead", "WdRcc", {0, 0, 0, 0, 0}, 0},
    {"LockedForRead", "lRc", {0, 0, 0}, 0},
    {"LockedForWrite", "lW", {0, 87}, 0},
    {"LockedUpgrade", "lRuc", {0, 0, 87, 0}, 0},
    {"LockedWhileOpen", "WldRcc", {0, 0, 0, 0, 0, 0}, 0},
    {"Erased", "WecRW", {0, 0, 0, 1009, 1009}, 0},
    {"ReaderDoesNotErase", "Rec", {0, 1011, 0}, 0},
    {"LeftOpen", "RR", {0, 0}, 2},
};

class Openings : public testing::TestWithParam<Walk>, protected DrawingFixture {
protected:
    int step(char action) {
        TzDbMText& text = at<TzDbMText>(id_);
        TzDbObject* opened = nullptr;
        switch (action) {
        case 'R': return tzdbOpenTzDbObject(opened, id_, TzDb::kForRead);
        case 'W': return tzdbOpenTzDbObject(opened, id_, TzDb::kForWrite);
        case 'u': return text.upgradeOpen();
        case 'd': return text.downgradeOpen();
        case 'c': return text.close();
        case 'e': return text.erase();
        default: lock(drawing->clayer(), true); return 0;
        }
    }

    TzDbObjectId id_ = addText(L"abc");
};

TEST_P(Openings, GiveTheStatusOf) {
    std::vector<int> statuses;
    for (char const* at = GetParam().steps; *at; ++at)
        statuses.push_back(step(*at));
    EXPECT_EQ(statuses, GetParam().statuses);
    EXPECT_EQ(tzhost::audit().openObjects, GetParam().open);
    while (at<TzDbMText>(id_).close() == Tzad::eOk) {
    }
}

INSTANTIATE_TEST_SUITE_P(Walks, Openings, testing::ValuesIn(kWalks), [](auto const& row) {
    return row.param.name;
});

TEST_F(DrawingTest, TextInNoDrawingIsOpenForWrite) {
    TzDbMText text;
    text.setDatabaseDefaults(drawing.get());
    EXPECT_EQ(text.database(), nullptr);
    EXPECT_TRUE(text.isWriteEnabled());
    EXPECT_EQ(text.upgradeOpen(), Tzad::eAlreadyOpenForWrite);
    EXPECT_EQ(text.downgradeOpen(), Tzad::eNoDatabase);
    EXPECT_TRUE(text.isWriteEnabled());
    EXPECT_EQ(text.close(), Tzad::eNoDatabase);
}

TEST_F(DrawingTest, ObjectOfAnotherClassIsClosedAgain) {
    TzDbLayerTableRecord* layer = nullptr;
    EXPECT_EQ(tzdbOpenObject(layer, addText(L"abc"), TzDb::kForRead), Tzad::eWrongObjectType);
    EXPECT_EQ(layer, nullptr);
}

struct WritableRow {
    char const* name;
    TzDb::OpenMode mode;
    bool locked;
    bool writable;
};
constexpr WritableRow kWritableRows[] = {
    {"OfReader", TzDb::kForRead, false, true},
    {"OfWriter", TzDb::kForWrite, false, true},
    {"OfLockedReader", TzDb::kForRead, true, false},
};

class Writable : public testing::TestWithParam<WritableRow>, protected DrawingFixture {};
TEST_P(Writable, GivesBackWhatItTook) {
    TzDbObjectId const id = addText(L"abc");
    TzDbObjectId const other = addText(L"def");
    lock(drawing->clayer(), GetParam().locked);
    TzDbMText* text = nullptr;
    TzDbMText* next = nullptr;
    ASSERT_EQ(tzdbOpenObject(text, id, GetParam().mode), Tzad::eOk);
    ASSERT_EQ(tzdbOpenObject(next, other, GetParam().mode), Tzad::eOk);
    {
        WritableTzDbObject writable;
        EXPECT_EQ(writable.replaceObject(text), GetParam().writable);
        EXPECT_EQ(text->isWriteEnabled(), GetParam().writable);
        EXPECT_EQ(writable.replaceObject(next), GetParam().writable);
        EXPECT_FALSE(text->isReadEnabled());
        EXPECT_EQ(tzhost::audit().openObjects, 1);
    }
    EXPECT_EQ(tzhost::audit().openObjects, 0);
}
INSTANTIATE_TEST_SUITE_P(Rows, Writable, testing::ValuesIn(kWritableRows), [](auto const& row) {
    return row.param.name;
});

// What was open in a drawing that goes does not count as open in the next one.
TEST_F(DrawingTest, DrawingThatGoesTakesItsOpeningsAlong) {
    {
        auto other = tzhost::Drawing::create();
        TzDbLayerTable* table = nullptr;
        ASSERT_EQ(other->getLayerTable(table, TzDb::kForRead), Tzad::eOk);
        EXPECT_EQ(tzhost::audit().openObjects, 1);
    }
    EXPECT_EQ(tzhost::audit().openObjects, 0);
}

// An operation that gives something back does so even when the fault plan makes it report a
// failure.
TEST_F(DrawingTest, FaultsLeaveNothingLent) {
    TzDbObjectId const id = addText(L"abc");
    TzDbMText* text = nullptr;
    ASSERT_EQ(tzdbOpenObject(text, id, TzDb::kForWrite), Tzad::eOk);
    ASSERT_EQ(text->highlight(), Tzad::eOk);
    ASSERT_EQ(text->setVisibility(TzDb::kInvisible), Tzad::eOk);
    auto* const before = tzhost::setFaultHook([](std::string_view, int& status) {
        status = 7;
        return true;
    });
    TzDbMText* none = text;
    EXPECT_EQ(tzdbOpenObject(none, id, TzDb::kForRead), 7);
    EXPECT_EQ(none, nullptr);
    EXPECT_EQ(text->setContents(L"x"), 7);
    EXPECT_EQ(text->setVisibility(TzDb::kVisible), 7);
    EXPECT_EQ(text->unhighlight(), 7);
    EXPECT_EQ(text->downgradeOpen(), 7);
    EXPECT_EQ(text->close(), 7);
    tzhost::setFaultHook(before);
    EXPECT_EQ(text->contents(), L"abc");
    EXPECT_EQ(text->visibility(), TzDb::kVisible);
    EXPECT_EQ(tzhost::audit().openObjects, 0);
}

TEST_F(DrawingTest, ChangedEntitiesAreReportedWhenTheyClose) {
    std::vector<std::string> seen;
    auto const before =
        tzhost::setEventSink([&](tzhost::Event const& event) { seen.push_back(event.dump()); });
    TzDbObjectId const id = addText(L"abc");
    TzDbMText* text = nullptr;
    ASSERT_EQ(tzdbOpenObject(text, id, TzDb::kForWrite), Tzad::eOk);
    EXPECT_EQ(text->close(), Tzad::eOk);  // unchanged
    ASSERT_EQ(tzdbOpenObject(text, id, TzDb::kForRead), Tzad::eOk);
    EXPECT_EQ(text->highlight(), Tzad::eOk);
    ASSERT_EQ(text->upgradeOpen(), Tzad::eOk);
    EXPECT_EQ(text->setWidth(5), Tzad::eOk);
    EXPECT_EQ(text->downgradeOpen(), Tzad::eOk);
    EXPECT_EQ(text->unhighlight(), Tzad::eOk);
    EXPECT_EQ(text->close(), Tzad::eOk);
    tzhost::setEventSink(before);
    std::vector<std::string> const expected = {
        R"({"event":"write","handle":"1"})", R"({"event":"highlight","handle":"1","on":true})",
        R"({"event":"highlight","handle":"1","on":false})", R"({"event":"write","handle":"1"})"};
    EXPECT_EQ(seen, expected);
}

TEST_F(DrawingTest, NamesOfObjectsOutliveTheirDrawingUnharmed) {
    long long name[2];
    TzDbObjectId const id = addText(L"abc");
    ASSERT_EQ(tzdbGetTzsName(name, id), 0);
    TzDbObjectId found;
    EXPECT_EQ(tzdbGetObjectId(found, name), 0);
    EXPECT_EQ(found, id);
    drawing = tzhost::Drawing::create();
    tzhost::setWorkingDrawing(drawing.get());
    EXPECT_EQ(tzdbGetObjectId(found, name), Tzad::eUnknownHandle);
    EXPECT_TRUE(found.isNull());
}

}  // namespace
