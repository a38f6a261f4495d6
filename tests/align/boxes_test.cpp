// Boxes of texts on the working plane, and the nine points in them.

#include <gtest/gtest.h>

#include <cmath>
#include <cstdio>
#include <string>

#include "module/align/spacing/aligned_entity.h"
#include "module/align/spacing/text_axes.h"
#include "module/align/spacing/text_box_makers.h"
#include "tests/align/given_text.h"
#include "tests/database/drawing_fixture.h"
#include "tz/db/text.h"
#include "tz/mte/easy_object.h"
#include "tz/rx/resbuf.h"

namespace {

using tztest::GivenMaker;
using tztest::placed;

std::string textOf(TzGeBoundBlock3d const& box) {
    TzGePoint3d low;
    TzGePoint3d high;
    box.getMinMaxPoints(low, high);
    char text[96];
    // Zero is added so that a negative one loses its sign.
    std::snprintf(text, sizeof text, "%.4g %.4g  %.4g %.4g", low.x + 0.0, low.y + 0.0, high.x + 0.0,
                  high.y + 0.0);
    return text;
}

double const kHalf = std::sqrt(0.5);
TzGeMatrix3d const kPlan;
// X along the world's Y, Y along its Z, origin at 10,0,0.
TzGeMatrix3d const kUpright = placed({10, 0, 0}, {0, 1, 0}, {0, 0, 1});
TzGeMatrix3d const kTurned = placed({1, 1, 0}, {kHalf, kHalf, 0}, {-kHalf, kHalf, 0});

struct BoxRow {
    char const* name;
    TzGeMatrix3d system;
    TzGePoint3d base;
    TzGeVector3d sides[3];
    TzGeVector3d viewed;  // zero: no projection
    char const* box;
};
BoxRow const kBoxes[] = {
    {"AsItIs", kPlan, {15, 18, 0}, {{10, 0, 0}, {0, 4, 0}, {}}, {}, "15 18  25 22"},
    {"BackToFront", kPlan, {25, 22, 0}, {{-10, 0, 0}, {0, -4, 0}, {}}, {}, "15 18  25 22"},
    {"Turned45", kPlan, {0, 0, 0}, {{4, 4, 0}, {-1, 1, 0}, {}}, {}, "-1 0  4 5"},
    {"OwnSystem", kTurned, {1, 1, 0}, {{4, 4, 0}, {-1, 1, 0}, {}}, {}, "0 0  5.657 1.414"},
    {"UprightPlane", kUpright, {10, 2, 3}, {{0, 5, 0}, {0, 0, 1}, {}}, {}, "2 3  7 4"},
    {"ThickFirst", kPlan, {1, 1, 0}, {{0, 0, 7}, {3, 0, 0}, {0, 2, 0}}, {}, "1 1  4 3"},
    {"ThickSecond", kPlan, {1, 1, 0}, {{3, 0, 0}, {0, 0, 7}, {0, 2, 0}}, {}, "1 1  4 3"},
    // Two zero sides: the third counts as the one off the plane, so its length is dropped.
    {"OneSide", kPlan, {1, 1, 0}, {{}, {}, {3, 3, 0}}, {}, "1 1  1 1"},
    {"Above", kPlan, {1, 1, 9}, {{3, 0, 0}, {0, 2, 0}, {}}, {0, 0, 1}, "1 1  4 3"},
    {"AboveSlanted", kPlan, {1, 1, 9}, {{3, 0, 0}, {0, 2, 0}, {}}, {1, 0, 1}, "-8 1  -5 3"},
    {"AboveAlong", kPlan, {1, 1, 9}, {{3, 0, 0}, {0, 2, 0}, {}}, {1, 0, 0}, "1 1  4 3"},
    {"Leaning", kPlan, {1, 1, 0}, {{3, 0, 4}, {0, 2, 0}, {}}, {1, 0, 1}, "0 1  1 3"},
    // The second side alone leans: taken for flat, so nothing is moved along the direction.
    {"LeaningUp", kPlan, {1, 1, 0}, {{3, 0, 0}, {0, 2, 4}, {}}, {1, 0, 1}, "1 1  4 3"},
};
class Boxes : public testing::TestWithParam<BoxRow> {};
TEST_P(Boxes, LieOnThePlane) {
    BoxRow const& row = GetParam();
    TzDbObjectId const id;
    GivenMaker maker(id, row.system, {row.base, row.sides[0], row.sides[1], row.sides[2]});
    maker.setViewDirectionForProjection(row.viewed);
    TzGeBoundBlock3d const box = maker.makeBoundBox().value();
    EXPECT_EQ(textOf(box), row.box);
    TzGePoint3d upperLeft;
    TzGeVector3d sides[3];
    box.get(upperLeft, sides[0], sides[1], sides[2]);
    EXPECT_GE(sides[0].x, 0);
    EXPECT_LE(sides[1].y, 0);
}
INSTANTIATE_TEST_SUITE_P(Rows, Boxes, testing::ValuesIn(kBoxes), [](auto const& row) {
    return row.param.name;
});

// A box of 10 by 4 at 15,18; number, point.
struct PointRow {
    int direction;
    TzGePoint3d point;
};
PointRow const kPoints[] = {
    {0, {15, 22, 0}},  {1, {20, 22, 0}},  {2, {25, 22, 0}},     {3, {15, 20, 0}},
    {4, {20, 20, 0}},  {5, {25, 20, 0}},  {6, {15, 18, 0}},     {7, {20, 18, 0}},
    {8, {25, 18, 0}},  {9, {15, 22, 0}},  {10, {20, 20, 0}},    {11, {25, 22, 0}},
    {12, {15, 22, 0}}, {-1, {15, 22, 0}}, {32767, {15, 22, 0}},
};
TEST(ReferencePoints, AreThoseOfTheJustification) {
    for (PointRow const& row : kPoints) {
        tztest::GivenText text({15, 18}, {25, 22});
        text.prepareForDragging(static_cast<tagTextDirection>(row.direction));
        EXPECT_EQ(text.referencePoint(), row.point) << row.direction;
    }
}

class TextBoxes : public tzhost::test::DrawingTest {
protected:
    [[nodiscard]] static std::string boxOf(TzDbObjectId id, TzGeMatrix3d const& system = kPlan) {
        TzMTextAlignManipulatorEntity entity(id, system);
        entity.prepareForDragging(tagTextDirection::TL);
        return textOf(entity.boundingBox());
    }
};

// The host's own corners of the text, whatever it is attached by.
TEST_F(TextBoxes, OfMultiLineTextsAreThoseOfTheLayout) {
    for (int attachment = 1; attachment <= 9; ++attachment) {
        auto* const text = new TzDbMText;
        text->setDatabaseDefaults();
        (void)text->setContents(L"Room\\P12.5 m");
        (void)text->setLocation({20, 20, 5});
        (void)text->setDirection({0.6, 0.8, 0});
        (void)text->setAttachment(static_cast<TzDbMText::AttachmentPoint>(attachment));
        TzArray<TzGePoint3d> corners;
        text->getBoundingPoints(corners);
        TzGeBoundBlock3d wanted;
        for (TzGePoint3d const& corner : corners)
            wanted.extend(corner);
        EXPECT_EQ(boxOf(add(text)), textOf(wanted)) << attachment;
    }
}

TEST_F(TextBoxes, OfSingleLinesAreExactInTheirOwnAxes) {
    auto* const text = new TzDbText;
    text->setDatabaseDefaults();
    (void)text->setTextString(L"Door");
    (void)text->setHeight(2);
    (void)text->setNormal({0, -1, 0});
    (void)text->setRotation(0.5);
    (void)text->setPosition({7, 8, 9});
    TzDbObjectId const id = add(text);
    TzGeMatrix3d const own = calculateObjEcs({7, 8, 9}, {0, -1, 0}, 0.5);
    long long name[2] = {};
    ASSERT_EQ(tzdbGetTzsName(name, id), Tzad::eOk);
    double low[3];
    double high[3];
    resbuf* const data = tzdbEntGet(name);
    ASSERT_EQ(tzedTextBox(data, low, high), 5100);
    tzutRelRb(data);
    EXPECT_EQ(boxOf(id, own), textOf({TzGePoint3d(low[0], low[1], 0), {high[0], high[1], 0}}));
    // X of the arbitrary axes is the world's X, Y its Z: 0.5 radians up from there.
    EXPECT_TRUE(own.xAxis().isEqualTo({std::cos(0.5), 0, std::sin(0.5)}));
    EXPECT_TRUE(own.origin().isEqualTo({7, 8, 9}));
}

// The lines of a definition wrap at 4 units; measured they stand in one line.
TEST_F(TextBoxes, OfDefinitionsAreMeasuredWithoutTheirWidth) {
    auto* const lines = new TzDbMText;
    lines->setDatabaseDefaults();
    (void)lines->setContents(L"Three short words");
    (void)lines->setTextHeight(1);
    (void)lines->setWidth(4);
    double const wrapped = lines->actualHeight();
    auto* const definition = new TzDbAttributeDefinition;
    definition->setDatabaseDefaults();
    ASSERT_EQ(definition->setMTextAttributeDefinition(lines), Tzad::eOk);
    TzDbObjectId const id = add(definition);
    TzMTextAlignManipulatorEntity entity(id, kPlan);
    entity.prepareForDragging(tagTextDirection::TL);
    TzGePoint3d low;
    TzGePoint3d high;
    entity.boundingBox().getMinMaxPoints(low, high);
    EXPECT_LT(high.y - low.y, wrapped / 2);
    EXPECT_GT(high.x - low.x, 8);
    EXPECT_EQ(at<TzDbAttributeDefinition>(id).getMTextAttributeDefinitionConst()->width(), 4);
}

TEST_F(TextBoxes, MoveTheTextOnceAndOnlyWhenToldTo) {
    TzDbObjectId const id = addText(L"Moved");
    TzMTextAlignManipulatorEntity entity(id, kPlan);
    entity.prepareForDragging(tagTextDirection::BL);
    TzGePoint3d const reference = entity.referencePoint();
    entity.move({5, 0, 0});
    entity.move({3, 4, 0});
    entity.move({3, 4, 0});
    entity.prepareForDragging(tagTextDirection::BL);
    entity.move({1e308, NAN, 0});
    EXPECT_TRUE(entity.referencePoint().isEqualTo(reference));
    EXPECT_TRUE(at<TzDbMText>(id).location().isEqualTo({0, 0, 0}));
    entity.replaceDbEntity();
    EXPECT_TRUE(at<TzDbMText>(id).location().isEqualTo({3, 4, 0}));
}

// Somebody holds the text: it is neither copied nor measured, and stays.
TEST_F(TextBoxes, LeaveOutWhatCannotBeOpened) {
    TzDbObjectId const id = addText(L"Held");
    EasyObject<TzDbMText> held;
    ASSERT_EQ(tzdbOpenObject(held.object, id, TzDb::kForWrite), Tzad::eOk);
    TzMTextAlignManipulatorEntity entity(id, placed({3, 3, 0}, {1, 0, 0}, {0, 1, 0}));
    entity.prepareForDragging(tagTextDirection::MC);
    EXPECT_TRUE(entity.referencePoint().isEqualTo({0, 0, 0}));
    (void)held->close();
    held.object = nullptr;
    entity.move({3, 4, 0});
    entity.replaceDbEntity();
    EXPECT_TRUE(at<TzDbMText>(id).location().isEqualTo({0, 0, 0}));
}

}  // namespace
