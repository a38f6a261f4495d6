#include <gtest/gtest.h>

#include <cmath>
#include <numbers>
#include <string>

#include "tz/ge/arbitrary_axis.h"
#include "tz/ge/point3d.h"

namespace {

constexpr double kPi = std::numbers::pi;

// What two vectors are to each other, one letter each: p parallel, c of the same sense as well,
// r perpendicular, e equal.
std::string relationOf(TzGeVector3d const& a, TzGeVector3d const& b) {
    std::string letters;
    if (a.isParallelTo(b)) letters += 'p';
    if (a.isCodirectionalTo(b)) letters += 'c';
    if (a.isPerpendicularTo(b)) letters += 'r';
    if (a.isEqualTo(b)) letters += 'e';
    return letters;
}

struct RelationCase {
    char const* name;
    TzGeVector3d a;
    TzGeVector3d b;
    char const* relation;
};
constexpr RelationCase kRelations[] = {
    {"Same", {1, 2, 3}, {1, 2, 3}, "pce"},
    {"Longer", {1, 2, 3}, {1e9, 2e9, 3e9}, "pc"},
    {"Huge", {1e200, 2e200, 0}, {1e300, 2e300, 0}, "pc"},
    {"Opposite", {0, 5, 0}, {0, -1e-3, 0}, "p"},
    {"RightAngle", {0, 5, 0}, {7, 0, 1e6}, "r"},
    {"TiltWithin", {1, 0, 0}, {1e6, 0.9e-4, 0}, "pc"},
    {"TiltBeyond", {1, 0, 0}, {1e6, 1.1e-4, 0}, ""},
    {"LeanWithin", {1, 0, 0}, {0.9e-4, 1e6, 0}, "r"},
    {"LeanBeyond", {1, 0, 0}, {1.1e-4, 1e6, 0}, ""},
    {"ShortHasDirection", {1.1e-10, 0, 0}, {1, 0, 0}, "pc"},
    {"TooShort", {1e-10, 0, 0}, {1, 0, 0}, ""},
    {"TooShortAcross", {1, 0, 0}, {0, 1e-10, 0}, ""},
    {"ZeroAndZero", {0, 0, 0}, {0, 0, 0}, "e"},
    {"EqualWithin", {1, 1, 1}, {1, 1, 1 + 0.9e-10}, "pce"},
    {"EqualBeyond", {1, 1, 1}, {1, 1 + 0.8e-10, 1 + 0.8e-10}, "pc"},
};
class VectorRelations : public testing::TestWithParam<RelationCase> {};
TEST_P(VectorRelations, HoldBothWays) {
    auto const& row = GetParam();
    EXPECT_EQ(relationOf(row.a, row.b), row.relation);
    EXPECT_EQ(relationOf(row.b, row.a), row.relation);
}
INSTANTIATE_TEST_SUITE_P(Rows, VectorRelations, testing::ValuesIn(kRelations), [](auto const& row) {
    return row.param.name;
});

struct AngleCase {
    char const* name;
    TzGeVector3d a;
    TzGeVector3d b;
    double angle;
};
const AngleCase kAngles[] = {
    {"Quarter", {2, 0, 0}, {0, -3, 0}, kPi / 2},
    {"Half", {1, 1, 0}, {-4, -4, 0}, kPi},
    {"Zero", {0, 0, 0}, {1, 0, 0}, 0},
    // Through the cosine this came out as 0.
    {"Tiny", {1, 0, 0}, {1, 1e-9, 0}, 1e-9},
    {"OneDegree", {0, 1, 0}, {std::sin(kPi / 180), std::cos(kPi / 180), 0}, kPi / 180},
};
class VectorAngles : public testing::TestWithParam<AngleCase> {};
TEST_P(VectorAngles, AreUnsigned) {
    auto const& row = GetParam();
    EXPECT_NEAR(row.a.angleTo(row.b), row.angle, 1e-15);
    EXPECT_NEAR(row.b.angleTo(row.a), row.angle, 1e-15);
}
INSTANTIATE_TEST_SUITE_P(Rows, VectorAngles, testing::ValuesIn(kAngles), [](auto const& row) {
    return row.param.name;
});

struct TurnCase {
    char const* name;
    TzGeVector3d vector;
    double angle;
    TzGeVector3d axis;
    TzGeVector3d result;
};
const TurnCase kTurns[] = {
    {"AnticlockwiseAboutZ", {1, 0, 0}, kPi / 2, {0, 0, 9}, {0, 1, 0}},
    {"ClockwiseAboutMinusZ", {1, 0, 0}, kPi / 2, {0, 0, -1}, {0, -1, 0}},
    {"AboutX", {0, 1, 0}, kPi / 2, {1, 0, 0}, {0, 0, 1}},
    {"AlongTheAxisStays", {2, 2, 2}, 1.0, {1, 1, 1}, {2, 2, 2}},
    {"ThirdAboutDiagonal", {1, 0, 0}, 2 * kPi / 3, {1, 1, 1}, {0, 1, 0}},
    {"ZeroAxisTurnsNothing", {1, 2, 3}, 1.0, {0, 0, 0}, {1, 2, 3}},
};
class VectorTurns : public testing::TestWithParam<TurnCase> {};
TEST_P(VectorTurns, FollowTheRightHand) {
    auto const& row = GetParam();
    EXPECT_TRUE(TzGeVector3d(row.vector).rotateBy(row.angle, row.axis).isEqualTo(row.result));
    TzGePoint3d const centre(10, 20, 30);
    TzGePoint3d const turned = (centre + row.vector).rotateBy(row.angle, row.axis, centre);
    EXPECT_TRUE(turned.isEqualTo(centre + row.result));
}
INSTANTIATE_TEST_SUITE_P(Rows, VectorTurns, testing::ValuesIn(kTurns), [](auto const& row) {
    return row.param.name;
});

TEST(Vectors, NoTurnIsExact) {
    TzGeVector3d v(0.1, 0.2, 0.3);
    v.rotateBy(0.0, TzGeVector3d(1, 2, 3));
    EXPECT_EQ(v.x, 0.1);
    EXPECT_EQ(v.y, 0.2);
    EXPECT_EQ(v.z, 0.3);
}

TEST(Vectors, NormalKeepsZeroAndSurvivesExtremes) {
    EXPECT_EQ(TzGeVector3d(1e-10, 0, 0).normal().x, 1e-10);
    EXPECT_NEAR(TzGeVector3d(2e-10, 0, 0).normal().x, 1.0, 1e-15);
    EXPECT_NEAR(TzGeVector3d(3e300, 4e300, 0).normal().y, 0.8, 1e-15);
    EXPECT_NEAR(TzGeVector3d(0, 3e-200, 4e-200).normal(TzGeTol(0.0)).z, 0.8, 1e-15);
}

TEST(Vectors, FlatAnglesRunOnceRound) {
    EXPECT_NEAR(TzGeVector2d(0, -2).angle(), 1.5 * kPi, 1e-15);
    EXPECT_EQ(TzGeVector2d(1, -1e-30).angle(), 0.0);
    EXPECT_EQ(TzGeVector2d(0, 0).angle(), 0.0);
    EXPECT_TRUE(TzGeVector2d(3, 4).rotateBy(kPi / 2).isEqualTo(TzGeVector2d(3, 4).perpVector()));
}

TEST(Points, AreEqualUpToTheLimit) {
    TzGePoint3d const p(1, 2, 3);
    EXPECT_TRUE(p.isEqualTo({1, 2, 3 + 0.9e-10}));
    // Each coordinate is within the limit; the distance is not.
    EXPECT_FALSE(p.isEqualTo({1 + 0.8e-10, 2 + 0.8e-10, 3}));
    EXPECT_TRUE(p.isEqualTo({1.5, 2, 3}, TzGeTol(0.5)));
}

struct AxisCase {
    char const* name;
    TzGeVector3d normal;
    TzGeVector3d xAxis;
};
double const kLimit = 1.0 / 64.0;
const AxisCase kAxes[] = {
    {"World", {0, 0, 1}, {1, 0, 0}},
    {"FromBelow", {0, 0, -1}, {-1, 0, 0}},
    {"Front", {0, -1, 0}, {1, 0, 0}},
    {"Side", {7, 0, 0}, {0, 1, 0}},
    {"ZeroIsWorld", {0, 0, 0}, {1, 0, 0}},
    // Just inside the cone about Z the Y axis rules, at its edge the Z axis does.
    {"InsideTheCone",
     {kLimit - 1e-9, 0, std::sqrt(1 - kLimit * kLimit)},
     {0.9998779222195, 0, -0.015625}},
    {"AtItsEdge", {kLimit, 0, std::sqrt(1 - kLimit * kLimit)}, {0, 1, 0}},
    {"BeyondInYOnly", {0, kLimit + 1e-9, std::sqrt(1 - kLimit * kLimit)}, {-1, 0, 0}},
};
class ArbitraryAxes : public testing::TestWithParam<AxisCase> {};
TEST_P(ArbitraryAxes, FollowTheRule) {
    auto const& row = GetParam();
    TzGeMatrix3d const axes = atwt(row.normal);
    EXPECT_TRUE(axes.xAxis().isEqualTo(row.xAxis, TzGeTol(1e-8)))
        << axes.xAxis().x << ' ' << axes.xAxis().y;
    EXPECT_TRUE(axes.xAxis().crossProduct(axes.yAxis()).isEqualTo(axes.zAxis()));
    EXPECT_TRUE(axes.isUniScaledOrtho());
    EXPECT_NEAR(axes.det(), 1.0, 1e-14);
}
INSTANTIATE_TEST_SUITE_P(Rows, ArbitraryAxes, testing::ValuesIn(kAxes), [](auto const& row) {
    return row.param.name;
});

}  // namespace
