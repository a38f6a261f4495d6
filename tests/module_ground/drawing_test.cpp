// The rules that look into a drawing: text styles and their heights, colours, locks, posting,
// upgrades. Whatever they open they close again, also when an opening fails.

#include <gtest/gtest.h>

#include <limits>
#include <memory>

#include "host/base/audit.h"
#include "host/base/fault_point.h"
#include "host/database/drawing.h"
#include "host/database/object_record.h"
#include "module/holders/easy_upgrade.h"
#include "module/host_calls/lock_tests.h"
#include "module/host_calls/space_posting.h"
#include "module/styles/drawing_colors.h"
#include "module/styles/style_rules.h"
#include "tests/module_ground/variables_fixture.h"
#include "tz/db/extensions.h"
#include "tz/db/shapes.h"
#include "tz/mte/easy_object.h"

namespace {

// Lets the n-th call of one operation fail.
std::string_view faultyOperation;
int callsUntilFault = 0;
bool failOnce(std::string_view operation, int& status) {
    if (operation != faultyOperation || --callsUntilFault != 0) return false;
    status = Tzad::eInternal;
    return true;
}

class InDrawing : public WithVariables {
protected:
    InDrawing() { tzhost::setWorkingDrawing(drawing_.get()); }
    ~InDrawing() override {
        tzhost::setFaultHook(nullptr);
        EXPECT_TRUE(tzhost::audit().clean());
        tzhost::setWorkingDrawing(nullptr);
    }

    void failAt(std::string_view operation, int call) {
        faultyOperation = operation;
        callsUntilFault = call;
        tzhost::setFaultHook(failOnce);
    }

    TzDbObjectId addStyle(wchar_t const* name, double height, bool annotative) {
        EasyTable<TzDbTextStyleTable> table;
        EXPECT_EQ(drawing_->getTextStyleTable(table.object, TzDb::kForWrite), Tzad::eOk);
        EasyObject<TzDbTextStyleTableRecord> style(new TzDbTextStyleTableRecord);
        EXPECT_EQ(style->setName(name), Tzad::eOk);
        EXPECT_EQ(style->setTextSize(height), Tzad::eOk);
        TzDbObjectId id;
        EXPECT_EQ(table->addRecord(style.object, id), Tzad::eOk);
        auto* const extension = tzrxQuery<TzDbAnnotativeObjectPE>(style.object);
        EXPECT_EQ(extension->setAnnotative(style.object, annotative), Tzad::eOk);
        return id;
    }

    std::unique_ptr<tzhost::Drawing> drawing_ = tzhost::Drawing::create();
};

TEST_F(InDrawing, StylesAreFoundByNameAndById) {
    TzDbObjectId const style = addStyle(L"Notes", 0, false);
    EXPECT_EQ(GetTextStyleID(L"NOTES"), style);
    EXPECT_TRUE(GetTextStyleID(L"Other").isNull());
    EXPECT_STREQ(GetTextStyleName(style), L"Notes");
    EXPECT_EQ(GetTextStyleName(TzDbObjectId()), nullptr);
    EXPECT_STREQ(GetCurrentTextStyleName(), L"Standard");
    TzString name(L"kept");
    EXPECT_FALSE(GetTextStyleNameFromID(TzDbObjectId(), name));
    EXPECT_EQ(name, L"kept");
    EXPECT_TRUE(GetTextStyleNameFromID(style, name));
    EXPECT_EQ(name, L"Notes");
    TzDbObjectId found = style;
    EXPECT_FALSE(GetIDFromTextStyleName(L"Other", found));
    EXPECT_TRUE(found.isNull());
}

struct SizeRow {
    char const* name;
    double height;  // of the style
    bool annotative;
    bool current;  // whether it is the style in force
    wchar_t const* scale;
    wchar_t const* textSize;
    double size;
};
constexpr SizeRow kSizes[] = {
    {"Fixed", 2.5, false, false, L"0.5", L"0.2", 2.5},
    {"FixedAnnotative", 2.5, true, false, L"0.5", L"0.2", 5},
    {"Variable", 0, false, false, L"0.5", L"3", 3},
    {"VariableWithoutVariable", 0, false, false, L"0.5", L"0", 0.2},
    // TEXTSIZE is scaled for the style in force, not for the one that is asked about.
    {"VariableAnnotativeInForce", 0, true, true, L"0.5", L"3", 6},
    {"VariableAnnotativeNotInForce", 0, true, false, L"0.5", L"3", 3},
};
class TextSizes : public InDrawing, public testing::WithParamInterface<SizeRow> {};
TEST_P(TextSizes, FollowStyleScaleAndVariable) {
    SizeRow const& row = GetParam();
    TzDbObjectId const style = addStyle(L"Notes", row.height, row.annotative);
    if (row.current) {
        ASSERT_EQ(drawing_->setTextstyle(style), Tzad::eOk);
    }
    give(L"CANNOSCALEVALUE", row.scale);
    give(L"TEXTSIZE", row.textSize);
    EXPECT_EQ(StyleIsAnnotative(style), row.annotative);
    EXPECT_EQ(ComputeTextSize(style), row.size);
    if (row.current) {
        EXPECT_EQ(ComputeTextSize(), row.size);
    }
}
INSTANTIATE_TEST_SUITE_P(Rows, TextSizes, testing::ValuesIn(kSizes), [](auto const& row) {
    return row.param.name;
});

TEST_F(InDrawing, StylesThatDoNotOpenGiveTheFallback) {
    TzDbObjectId const style = addStyle(L"Notes", 2.5, true);
    failAt("tzdbOpenObject", 1);
    EXPECT_FALSE(StyleIsAnnotative(style));
    failAt("tzdbOpenObject", 1);
    EXPECT_EQ(GetTextStyleName(style), nullptr);
    failAt("tzdbOpenObject", 1);
    give(L"CANNOSCALEVALUE", L"2");
    EXPECT_EQ(ComputeTextSize(style), 0.1);
    EXPECT_EQ(ComputeTextSize(TzDbObjectId()), 0.2);
    EXPECT_FALSE(StyleIsAnnotative(drawing_->clayer()));
}

TEST_F(InDrawing, VerticalStylesHaveAnAtSignBeforeTheirTypeface) {
    EasyObject<TzDbTextStyleTableRecord> style;
    EXPECT_FALSE(IsVerticalTTF(style));
    ASSERT_EQ(tzdbOpenObject(style.object, drawing_->textstyle(), TzDb::kForWrite), Tzad::eOk);
    EXPECT_FALSE(IsVerticalTTF(style));
    EXPECT_EQ(style->setFont(L"@DejaVu Sans", false, false, 0, 0), Tzad::eOk);
    EXPECT_TRUE(IsVerticalTTF(style));
    EXPECT_FALSE(IsVerticalTTF()) << "it is open for write here";
    EXPECT_EQ(style->setFont(L"DejaVu Sans", false, false, 0, 0), Tzad::eOk);
    EXPECT_FALSE(IsVerticalTTF(style));
}

TEST_F(InDrawing, ColoursComeFromTheLayer) {
    EXPECT_EQ(GetCurrentDrawingByLayerColor(), 0xFFFFFFU);
    EXPECT_EQ(GetCurrentDrawingByBlockColor(), 0xFFFFFFU);
    {
        EasyObject<TzDbLayerTableRecord> layer;
        ASSERT_EQ(tzdbOpenObject(layer.object, drawing_->clayer(), TzDb::kForWrite), Tzad::eOk);
        EXPECT_EQ(layer->setColor(TzCmColor(0x12, 0x34, 0x56)), Tzad::eOk);
    }
    EXPECT_EQ(GetCurrentDrawingByLayerColor(), 0x563412U);
    {
        EasyObject<TzDbLayerTableRecord> layer;
        ASSERT_EQ(tzdbOpenObject(layer.object, drawing_->clayer(), TzDb::kForWrite), Tzad::eOk);
        EXPECT_EQ(layer->setColor(TzCmColor(TzCmEntityColor::fromIndex(5))), Tzad::eOk);
    }
    EXPECT_EQ(GetCurrentDrawingByLayerColor(), 0xFF0000U);
}

TzDbLine* newLine() {
    auto* const line = new TzDbLine;
    line->setDatabaseDefaults();
    EXPECT_EQ(line->setEndPoint(TzGePoint3d(1, 0, 0)), Tzad::eOk);
    return line;
}

int entitiesIn(TzDbObjectId space) {
    EasyObject<TzDbBlockTableRecord> record;
    if (tzdbOpenObject(record.object, space, TzDb::kForRead) != Tzad::eOk) return -1;
    TzArray<TzDbObjectId> ids;
    record->entities(ids);
    return ids.length();
}

TEST_F(InDrawing, EntitiesArePostedToTheirSpace) {
    TzDbObjectId id;
    EXPECT_EQ(postToDb(newLine(), id, false), Tzad::eOk);
    EXPECT_FALSE(id.isNull());
    EXPECT_EQ(postToDb(newLine(), true), Tzad::eOk);
    EXPECT_EQ(postToDb(newLine(), true), Tzad::eOk);
    EXPECT_EQ(entitiesIn(drawing_->modelSpace()), 1);
    EXPECT_EQ(entitiesIn(drawing_->paperSpace()), 2);
}

// The entity is deleted wherever posting fails; the leak checker sees one that is not.
TEST_F(InDrawing, EntitiesThatCannotBePostedAreDeleted) {
    for (std::string_view operation : {"TzDbDatabase::getBlockTable", "TzDbBlockTable::getAt",
                                       "TzDbBlockTableRecord::appendTzDbEntity"}) {
        TzDbObjectId id;
        failAt(operation, 1);
        EXPECT_NE(postToDb(newLine(), id, false), Tzad::eOk) << operation;
        EXPECT_TRUE(id.isNull());
        tzhost::setFaultHook(nullptr);
    }
    tzhost::setWorkingDrawing(nullptr);
    EXPECT_EQ(postToDb(new TzDbLine, false), Tzad::eNoDocument);
    tzhost::setWorkingDrawing(drawing_.get());
    EXPECT_EQ(entitiesIn(drawing_->modelSpace()), 0);
}

TEST_F(InDrawing, LocksAreThoseOfTheLayerAndOfTheWorkingSet) {
    TzDbObjectId id;
    ASSERT_EQ(postToDb(newLine(), id, false), Tzad::eOk);
    EasyObject<TzDbEntity> line;
    ASSERT_EQ(tzdbOpenObject(line.object, id, TzDb::kForRead), Tzad::eOk);
    EXPECT_FALSE(IsOnLockedLayer(line.object));
    {
        EasyObject<TzDbLayerTableRecord> layer;
        ASSERT_EQ(tzdbOpenObject(layer.object, drawing_->clayer(), TzDb::kForWrite), Tzad::eOk);
        EXPECT_EQ(layer->setIsLocked(true), Tzad::eOk);
    }
    EXPECT_TRUE(IsOnLockedLayer(line.object));
    failAt("tzdbOpenObject", 1);
    EXPECT_FALSE(IsOnLockedLayer(line.object));

    std::unique_ptr<TzDbEntity> const loose(newLine());
    struct Row {
        bool exists;
        bool active;
        bool member;
        bool locked;
    };
    for (Row const& row : {Row{false, false, false, false},
                           {true, false, false, false},
                           {false, true, false, false},
                           {true, true, true, false},
                           {true, true, false, true}}) {
        id.record()->inWorkingSet = row.member;
        tzhost::DrawingSettings settings = drawing_->settings();
        settings.workingSetExists = row.exists;
        settings.workingSetActive = row.active;
        drawing_->setSettings(settings);
        EXPECT_EQ(IsLockedFromWorkingSet(line.object), row.locked);
        EXPECT_FALSE(IsLockedFromWorkingSet(loose.get()));
    }
}

TEST_F(InDrawing, UpgradesAreGivenBack) {
    TzDbObjectId id;
    ASSERT_EQ(postToDb(newLine(), id, false), Tzad::eOk);
    EasyObject<TzDbEntity> line;
    ASSERT_EQ(tzdbOpenObject(line.object, id, TzDb::kForRead), Tzad::eOk);
    {
        CEasyUpgrade holder;
        EXPECT_TRUE(holder.Upgrade(line.object));
        EXPECT_TRUE(line->isWriteEnabled());
        EXPECT_TRUE(holder.Upgrade(line.object)) << "by this holder";
        EXPECT_FALSE(CEasyUpgrade().Upgrade(line.object)) << "by another one";
        EXPECT_TRUE(line->isWriteEnabled());
        holder.Downgrade();
        EXPECT_FALSE(line->isWriteEnabled());
        holder.Downgrade();
        EXPECT_TRUE(holder.Upgrade(line.object));
    }
    EXPECT_FALSE(line->isWriteEnabled());
    failAt("TzDbObject::upgradeOpen", 1);
    EXPECT_FALSE(CEasyUpgrade().Upgrade(line.object));
    EXPECT_FALSE(line->isWriteEnabled());
}

}  // namespace
