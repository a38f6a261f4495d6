#include <cmath>
#include <numbers>

#include "host/base/audit.h"
#include "host/settings/variables.h"
#include "tests/database/drawing_fixture.h"
#include "tz/ed/ucs.h"

using tzhost::test::DrawingTest;

namespace {

constexpr double kRight = std::numbers::pi / 2;

tzhost::VariablePoint viewDirection() {
    return std::get<tzhost::VariablePoint>(*tzhost::Variables::instance().get(L"VIEWDIR"));
}

TEST_F(DrawingTest, SystemsAreSetAndRestored) {
    TzGeMatrix3d const turned =
        TzGeMatrix3d::translation({1, 2, 3}) * TzGeMatrix3d::rotation(kRight, {0, 0, 1});
    ASSERT_EQ(tzedSetCurrentUCS(turned), 0);
    EXPECT_EQ(tzhost::audit().ucsStack, 1);
    double point[3] = {1, 0, 0};
    EXPECT_TRUE(tzdbUcs2Wcs(point, point, false));
    EXPECT_EQ(TzGePoint3d(point[0], point[1], point[2]), TzGePoint3d(1, 3, 3));
    EXPECT_TRUE(tzdbWcs2Ucs(point, point, false));
    EXPECT_EQ(TzGePoint3d(point[0], point[1], point[2]), TzGePoint3d(1, 0, 0));
    EXPECT_TRUE(tzdbUcs2Wcs(point, point, true));
    EXPECT_EQ(TzGePoint3d(point[0], point[1], point[2]), TzGePoint3d(0, 1, 0));
    EXPECT_EQ(tzedRestorePreviousUCS(), 0);
    EXPECT_NE(tzedRestorePreviousUCS(), 0);
    EXPECT_EQ(drawing->ucsxdir(), TzGeVector3d::kXAxis);
}

TEST_F(DrawingTest, ImproperSystemsAreRefused) {
    TzGeMatrix3d mirrored;
    mirrored(2, 2) = -1;
    TzGeMatrix3d slanted;
    slanted(0, 1) = 0.5;
    for (TzGeMatrix3d const& matrix : {TzGeMatrix3d::scaling(2), mirrored, slanted}) {
        EXPECT_NE(tzedSetCurrentUCS(matrix), 0);
    }
    EXPECT_EQ(tzhost::audit().ucsStack, 0);
}

// The view does not turn with the user system, so VIEWDIR has other numbers in another system.
TEST_F(DrawingTest, ViewDirectionFollowsTheSystem) {
    ASSERT_EQ(tzedSetCurrentUCS(TzGeMatrix3d::rotation(kRight, {1, 0, 0})), 0);
    EXPECT_NEAR(viewDirection()[1], 1.0, 1e-15);
    auto& variables = tzhost::Variables::instance();
    (void)variables.set(L"CVPORT", short{1}, tzhost::Writer::user);
    (void)variables.set(L"TILEMODE", short{0}, tzhost::Writer::user);  // paper space, world system
    EXPECT_NEAR(viewDirection()[2], 1.0, 1e-15);
    EXPECT_EQ(drawing->activeSpace(), drawing->paperSpace());
    (void)variables.set(L"TILEMODE", short{1}, tzhost::Writer::user);
    EXPECT_NEAR(viewDirection()[1], 1.0, 1e-15);
    EXPECT_EQ(tzedRestorePreviousUCS(), 0);
    EXPECT_NEAR(viewDirection()[2], 1.0, 1e-15);
}

// It was 0,-1.4e-17,1 after this.
TEST_F(DrawingTest, ViewDirectionComesBackToTheLastDigit) {
    tzhost::VariablePoint const before = viewDirection();
    ASSERT_EQ(tzedSetCurrentUCS(TzGeMatrix3d::rotation(0.7, {0.3, 0.5, 0.7})), 0);
    EXPECT_EQ(tzedRestorePreviousUCS(), 0);
    EXPECT_EQ(viewDirection(), before);
}

TEST_F(DrawingTest, RotationCountsFromTheSystemsAxis) {
    TzDbMText text;
    (void)text.setDirection({0, 1, 0});
    EXPECT_DOUBLE_EQ(text.rotation(), kRight);
    ASSERT_EQ(tzedSetCurrentUCS(TzGeMatrix3d::rotation(kRight, {0, 0, 1})), 0);
    EXPECT_NEAR(text.rotation(), 0.0, 1e-15);
    (void)text.setRotation(kRight);
    EXPECT_EQ(text.direction(), TzGeVector3d(-1, 0, 0));
    EXPECT_EQ(tzedRestorePreviousUCS(), 0);
}

}  // namespace
