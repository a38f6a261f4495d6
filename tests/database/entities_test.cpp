#include <cmath>
#include <limits>
#include <numbers>

#include "host/database/symbol_imp.h"
#include "tests/database/drawing_fixture.h"
#include "tz/db/extensions.h"
#include "tz/db/shapes.h"
#include "tz/db/text.h"

using tzhost::test::DrawingTest;

namespace {

constexpr double kNan = std::numeric_limits<double>::quiet_NaN();
constexpr double kInfinity = std::numeric_limits<double>::infinity();
constexpr double kTiny = std::numeric_limits<double>::denorm_min();
constexpr double kRight = std::numbers::pi / 2;

struct SetterCase {
    char const* name;
    Tzad::ErrorStatus (*set)(TzDbMText& text);
    Tzad::ErrorStatus status;
};

using T = TzDbMText;
constexpr auto kOk = Tzad::eOk;
constexpr auto kOut = Tzad::eOutOfRange;
constexpr auto kFlat = Tzad::eDegenerateGeometry;

// Values at the edge of what a text takes.
constexpr SetterCase kSetters[] = {
    {"HeightZero", [](T& t) { return t.setTextHeight(0); }, kOut},
    {"HeightLeast", [](T& t) { return t.setTextHeight(kTiny); }, kOk},
    {"HeightNan", [](T& t) { return t.setTextHeight(kNan); }, kOut},
    {"HeightInfinite", [](T& t) { return t.setTextHeight(kInfinity); }, kOut},
    {"WidthZero", [](T& t) { return t.setWidth(0); }, kOk},
    {"WidthNegative", [](T& t) { return t.setWidth(-kTiny); }, kOut},
    {"SpacingLeast", [](T& t) { return t.setLineSpacingFactor(0.25); }, kOk},
    {"SpacingBelow", [](T& t) { return t.setLineSpacingFactor(0.2499999999); }, kOut},
    {"SpacingMost", [](T& t) { return t.setLineSpacingFactor(4); }, kOk},
    {"SpacingNan", [](T& t) { return t.setLineSpacingFactor(kNan); }, kOut},
    {"LocationNan", [](T& t) { return t.setLocation(TzGePoint3d(0, kNan, 0)); }, kFlat},
    {"LocationFar", [](T& t) { return t.setLocation(TzGePoint3d(1e300, 0, 0)); }, kOk},
    {"NormalZero", [](T& t) { return t.setNormal(TzGeVector3d(0, 0, 0)); }, kFlat},
    {"NormalBelowZero", [](T& t) { return t.setNormal(TzGeVector3d(0, 0, 1e-10)); }, kFlat},
    {"NormalLong", [](T& t) { return t.setNormal(TzGeVector3d(1e200, 1e200, 0)); }, kOk},
    {"DirectionParallel", [](T& t) { return t.setDirection(TzGeVector3d(0, 0, -2)); }, kFlat},
    {"DirectionSlanted", [](T& t) { return t.setDirection(TzGeVector3d(1, 0, 1)); }, kOk},
    {"AttachmentNone", [](T& t) { return t.setAttachment(T::AttachmentPoint{0}); }, kOut},
    {"AttachmentTen", [](T& t) { return t.setAttachment(T::AttachmentPoint{10}); }, kOut},
    {"RotationInfinite", [](T& t) { return t.setRotation(kInfinity); }, kFlat},
    {"ColumnsNone", [](T& t) { return t.setStaticColumns(1, 0, 0); }, kOut},
    {"GutterNegative", [](T& t) { return t.setColumnGutterWidth(-1); }, kOut},
    {"BackgroundSmall", [](T& t) { return t.setBackgroundScaleFactor(0.99); }, kOut},
    {"StyleNull", [](T& t) { return t.setTextStyle(TzDbObjectId::kNull); }, Tzad::eWrongObjectType},
    {"LayerNull", [](T& t) { return t.setLayer(TzDbObjectId::kNull); }, Tzad::eWrongObjectType},
    {"ColorAbove", [](T& t) { return t.setColorIndex(257); }, kOut},
    {"Flattened",
     [](T& t) {
         return t.transformBy(TzGeMatrix3d::projection(TzGePlane(), TzGeVector3d::kZAxis));
     },
     kFlat},
    {"MovedTooFar",
     [](T& t) { return t.transformBy(TzGeMatrix3d::translation(TzGeVector3d(kInfinity, 0, 0))); },
     kFlat},
    {"ColumnsTooLarge",
     [](T& t) {
         (void)t.setStaticColumns(1e200, 0, 2);
         return t.transformBy(TzGeMatrix3d::scaling(1e200));
     },
     kFlat},
    {"GrownTooLarge",
     [](T& t) {
         (void)t.setTextHeight(1e200);
         return t.transformBy(TzGeMatrix3d::scaling(1e200));
     },
     kFlat},
};

class Setters : public testing::TestWithParam<SetterCase> {};

TEST_P(Setters, Give) {
    TzDbMText text;
    (void)text.setLocation({1, 2, 3});
    EXPECT_EQ(GetParam().set(text), GetParam().status);
    if (GetParam().status == Tzad::eOk) return;
    EXPECT_EQ(text.location(), TzGePoint3d(1, 2, 3));
    EXPECT_EQ(text.normal(), TzGeVector3d::kZAxis);
    EXPECT_EQ(text.direction(), TzGeVector3d::kXAxis);
    EXPECT_EQ(text.lineSpacingFactor(), 1.0);
    EXPECT_EQ(text.attachment(), TzDbMText::kTopLeft);
}

INSTANTIATE_TEST_SUITE_P(Edges, Setters, testing::ValuesIn(kSetters), [](auto const& row) {
    return row.param.name;
});

TEST_F(DrawingTest, DirectionStaysInThePlane) {
    TzDbMText text;
    ASSERT_EQ(text.setDirection({3, 0, 4}), Tzad::eOk);
    EXPECT_EQ(text.direction(), TzGeVector3d::kXAxis);
    ASSERT_EQ(text.setNormal({5, 0, 0}), Tzad::eOk);
    EXPECT_EQ(text.normal(), TzGeVector3d::kXAxis);
    EXPECT_TRUE(text.direction().isPerpendicularTo(text.normal()));
}

TEST_F(DrawingTest, RotationThatATextHasKeepsItsDirectionToTheLastBit) {
    TzDbMText text;
    for (int tenths = 0; tenths < 60; ++tenths) {
        ASSERT_EQ(text.setDirection({std::cos(tenths * 0.1), std::sin(tenths * 0.1), 0}),
                  Tzad::eOk);
        TzGeVector3d const before = text.direction();
        ASSERT_EQ(text.setRotation(text.rotation()), Tzad::eOk);
        EXPECT_TRUE(text.direction().isEqualTo(before, TzGeTol(0))) << tenths;
    }
}

TEST_F(DrawingTest, AttachmentMovesTheLocationAndNotTheText) {
    for (wchar_t const* const typeface : {L"DejaVu Sans", L"@DejaVu Sans"}) {
        TzDbMText text;
        (void)text.setTextStyle(addStyle(typeface, typeface));
        (void)text.setContents(L"abc\\Pd");
        (void)text.setRotation(0.3);
        TzArray<TzGePoint3d> before;
        text.getBoundingPoints(before);
        // Top left of a face with "@" is the page's upper right corner. The box used to start there
        // and lay to the right of the letters.
        EXPECT_TRUE(before[typeface[0] == L'@' ? 1 : 0].isEqualTo(text.location()));
        for (int point = 1; point <= 9; ++point) {
            auto const attachment = TzDbMText::AttachmentPoint(point);
            ASSERT_EQ(text.setAttachmentMovingLocation(attachment), Tzad::eOk);
            TzArray<TzGePoint3d> after;
            text.getBoundingPoints(after);
            for (int i = 0; i < 4; ++i)
                EXPECT_TRUE(after[i].isEqualTo(before[i], TzGeTol(1e-12))) << point;
        }
    }
}

struct TransformCase {
    char const* name;
    TzGeMatrix3d matrix;
    TzGePoint3d place;       // of an entity at 1,0,0
    TzGeVector3d direction;  // of one along the X axis
    double height;           // of one of height 2
};

TransformCase const kTransforms[] = {
    {"Moved", TzGeMatrix3d::translation({1, 2, 3}), {2, 2, 3}, {1, 0, 0}, 2},
    {"Turned", TzGeMatrix3d::rotation(kRight, TzGeVector3d::kZAxis), {0, 1, 0}, {0, 1, 0}, 2},
    {"Upright", TzGeMatrix3d::rotation(kRight, TzGeVector3d::kXAxis), {1, 0, 0}, {1, 0, 0}, 2},
    {"Grown", TzGeMatrix3d::scaling(1e6), {1e6, 0, 0}, {1, 0, 0}, 2e6},
    {"Shrunk", TzGeMatrix3d::scaling(1e-12), {1e-12, 0, 0}, {1, 0, 0}, 2e-12},
};

class Transforms : public testing::TestWithParam<TransformCase> {};

TEST_P(Transforms, CarryTexts) {
    TransformCase const& row = GetParam();
    TzDbMText lines;
    (void)lines.setLocation({1, 0, 0});
    (void)lines.setTextHeight(2);
    ASSERT_EQ(lines.transformBy(row.matrix), Tzad::eOk);
    EXPECT_EQ(lines.location(), row.place);
    EXPECT_EQ(lines.direction(), row.direction);
    EXPECT_DOUBLE_EQ(lines.textHeight(), row.height);
    TzDbText line;
    (void)line.setPosition({1, 0, 0});
    (void)line.setHeight(2);
    ASSERT_EQ(line.transformBy(row.matrix), Tzad::eOk);
    EXPECT_EQ(line.position(), row.place);
    EXPECT_DOUBLE_EQ(line.height(), row.height);
    EXPECT_DOUBLE_EQ(line.widthFactor(), 1.0);
    TzDbCircle circle;
    (void)circle.setCenter({1, 0, 0});
    (void)circle.setRadius(2);
    ASSERT_EQ(circle.transformBy(row.matrix), Tzad::eOk);
    EXPECT_EQ(circle.center(), row.place);
    EXPECT_DOUBLE_EQ(circle.radius(), row.height);
}

INSTANTIATE_TEST_SUITE_P(Kinds, Transforms, testing::ValuesIn(kTransforms), [](auto const& row) {
    return row.param.name;
});

TEST_F(DrawingTest, ReferenceCarriesItsAttributes) {
    TzDbBlockTable* blocks = nullptr;
    ASSERT_EQ(drawing->getBlockTable(blocks, TzDb::kForWrite), Tzad::eOk);
    auto* const block = new TzDbBlockTableRecord;
    (void)block->setName(L"DOOR");
    TzDbObjectId blockId;
    ASSERT_EQ(blocks->addRecord(block, blockId), Tzad::eOk);
    EXPECT_EQ(blocks->close(), Tzad::eOk);
    auto* const own = new TzDbBlockReference;
    ASSERT_EQ(own->setBlockTableRecord(blockId), Tzad::eOk);
    TzDbObjectId none;
    EXPECT_EQ(block->appendTzDbEntity(none, own), Tzad::eInvalidInput) << "a block in itself";
    EXPECT_EQ(block->close(), Tzad::eOk);

    TzDbObjectId const id = add(own);
    TzDbBlockReference* reference = nullptr;
    ASSERT_EQ(tzdbOpenObject(reference, id, TzDb::kForWrite), Tzad::eOk);
    auto* const attribute = new TzDbAttribute;
    TzDbObjectId attributeId;
    ASSERT_EQ(reference->appendAttribute(attributeId, attribute), Tzad::eOk);
    EXPECT_EQ(attribute->close(), Tzad::eOk);
    ASSERT_EQ(reference->transformBy(TzGeMatrix3d::translation({1, 0, 0})), Tzad::eOk);
    EXPECT_EQ(at<TzDbAttribute>(attributeId).position(), TzGePoint3d(1, 0, 0));
    std::unique_ptr<TzDbObject> const copy(reference->clone());
    ASSERT_TRUE(copy);
    EXPECT_EQ(copy->database(), nullptr);
    EXPECT_EQ(reference->erase(), Tzad::eOk);
    EXPECT_EQ(reference->close(), Tzad::eOk);
    EXPECT_TRUE(attributeId.isErased());
}

TEST_F(DrawingTest, DefinitionKeepsItsOwnLinesAndTakesNoOthers) {
    TzDbAttributeDefinition one;
    auto* const lines = new TzDbMText;
    ASSERT_EQ(lines->setContents(L"two\\Plines"), Tzad::eOk);
    ASSERT_EQ(one.setMTextAttributeDefinition(lines), Tzad::eOk);
    EXPECT_EQ(one.setMTextAttributeDefinition(one.getMTextAttributeDefinition()), Tzad::eOk);
    EXPECT_EQ(one.getMTextAttributeDefinitionConst()->contents(), L"two\\Plines");
    TzDbAttributeDefinition other;
    EXPECT_EQ(other.setMTextAttributeDefinition(lines), Tzad::eInvalidInput);
    EXPECT_FALSE(other.isMTextAttributeDefinition());
}

// Each new record used to cost a walk over all records.
TEST_F(DrawingTest, NewRecordsLeaveTheIndexOfNamesAsItIs) {
    addLayer(L"A");
    unsigned int const before = tzhost::namesGeneration();
    TzDbObjectId const added = addLayer(L"B");
    EXPECT_EQ(tzhost::namesGeneration(), before);
    EXPECT_EQ(drawing->find(drawing->layerTableId(), L"b"), added);
    TzDbLayerTableRecord* record = nullptr;
    ASSERT_EQ(tzdbOpenObject(record, added, TzDb::kForWrite), Tzad::eOk);
    EXPECT_EQ(record->setName(L"C"), Tzad::eOk);
    EXPECT_EQ(record->close(), Tzad::eOk);
    EXPECT_EQ(drawing->find(drawing->layerTableId(), L"c"), added);
    EXPECT_TRUE(drawing->find(drawing->layerTableId(), L"B").isNull());
}

TEST_F(DrawingTest, RecordsInUseAreNotErased) {
    TzDbObjectId const used = addLayer(L"Used");
    TzDbObjectId const unused = addLayer(L"Unused");
    TzDbObjectId const id = addText(L"abc");
    TzDbMText* text = nullptr;
    ASSERT_EQ(tzdbOpenObject(text, id, TzDb::kForWrite), Tzad::eOk);
    EXPECT_EQ(text->setLayer(used), Tzad::eOk);
    EXPECT_EQ(text->close(), Tzad::eOk);
    for (TzDbObjectId const layer : {drawing->clayer(), used, unused}) {
        TzDbLayerTableRecord* record = nullptr;
        ASSERT_EQ(tzdbOpenObject(record, layer, TzDb::kForWrite), Tzad::eOk);
        EXPECT_EQ(record->erase(), layer == unused ? Tzad::eOk : Tzad::eInUse);
        EXPECT_EQ(record->close(), Tzad::eOk);
    }
    TzDbLayerTable* table = nullptr;
    ASSERT_EQ(drawing->getLayerTable(table, TzDb::kForRead), Tzad::eOk);
    EXPECT_FALSE(table->has(L"unused"));
    EXPECT_TRUE(table->has(L"USED"));
    TzDbSymbolTableIterator* walk = nullptr;
    ASSERT_EQ(table->newIterator(walk), Tzad::eOk);
    std::vector<TzDbObjectId> order;
    for (; !walk->done(); walk->step())
        order.push_back(walk->getRecordId());
    delete walk;
    EXPECT_EQ(table->close(), Tzad::eOk);
    EXPECT_EQ(order, (std::vector{drawing->clayer(), used}));
}

TEST_F(DrawingTest, TextsAndStylesHaveTheExtensions) {
    TzDbMText text;
    auto* const annotative = tzrxQuery<TzDbAnnotativeObjectPE>(&text);
    auto* const orientation = tzrxQuery<TzDbPaperOrientationPE>(&text);
    ASSERT_TRUE(annotative && orientation);
    EXPECT_EQ(annotative->setAnnotative(&text, true), Tzad::eOk);
    EXPECT_TRUE(annotative->annotative(&text));
    EXPECT_FALSE(orientation->paperOrientation(&text));
    EXPECT_FALSE(annotative->annotative(nullptr));
    EXPECT_TRUE(tzrxQuery<TzDbAnnotativeObjectPE>(drawing->textstyle().record()->object));
    TzDbLine const line;
    EXPECT_FALSE(tzrxQuery<TzDbAnnotativeObjectPE>(&line));
}

}  // namespace
