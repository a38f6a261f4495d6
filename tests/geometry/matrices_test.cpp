#include <gtest/gtest.h>

#include <cmath>
#include <numbers>
#include <string>

#include "tz/ge/bound_block3d.h"
#include "tz/ge/plane.h"

namespace {

constexpr double kPi = std::numbers::pi;

TzGeMatrix3d systemOf(TzGePoint3d const& origin,
                      TzGeVector3d const& x,
                      TzGeVector3d const& y,
                      TzGeVector3d const& z) {
    return TzGeMatrix3d().setCoordSystem(origin, x, y, z);
}

struct MatrixCase {
    char const* name;
    TzGeMatrix3d matrix;
    TzGePoint3d from;
    TzGePoint3d to;
};
const MatrixCase kMatrices[] = {
    {"Identity", TzGeMatrix3d(), {1, 2, 3}, {1, 2, 3}},
    {"Translation", TzGeMatrix3d::translation({10, 20, 30}), {1, 2, 3}, {11, 22, 33}},
    {"QuarterTurn", TzGeMatrix3d::rotation(kPi / 2, {0, 0, 2}, {10, 0, 0}), {11, 0, 5}, {10, 1, 5}},
    {"Scaling", TzGeMatrix3d::scaling(3, {1, 1, 1}), {2, 1, 0}, {4, 1, -2}},
    {"TinyScaling", TzGeMatrix3d::scaling(1e-7), {1, 2, 3}, {1e-7, 2e-7, 3e-7}},
    {"System", systemOf({5, 6, 7}, {0, 1, 0}, {-1, 0, 0}, {0, 0, 1}), {1, 2, 3}, {3, 7, 10}},
    {"Mirror", systemOf({0, 0, 0}, {-1, 0, 0}, {0, 1, 0}, {0, 0, 1}), {1, 2, 3}, {-1, 2, 3}},
    {"Skew", systemOf({0, 0, 0}, {1, 0, 0}, {1, 1, 0}, {0, 2, 4}), {1, 1, 1}, {2, 3, 4}},
    {"RightAppliesFirst",
     TzGeMatrix3d::translation({1, 0, 0}) * TzGeMatrix3d::scaling(2),
     {1, 1, 1},
     {3, 2, 2}},
    {"PostMult",
     TzGeMatrix3d::scaling(2).postMultBy(TzGeMatrix3d::translation({1, 0, 0})),
     {1, 1, 1},
     {4, 2, 2}},
    {"PreMult",
     TzGeMatrix3d::scaling(2).preMultBy(TzGeMatrix3d::translation({1, 0, 0})),
     {1, 1, 1},
     {3, 2, 2}},
};
class Matrices : public testing::TestWithParam<MatrixCase> {};
TEST_P(Matrices, GoThereAndBack) {
    auto const& row = GetParam();
    TzGePoint3d point = row.from;
    EXPECT_TRUE(point.transformBy(row.matrix).isEqualTo(row.to))
        << point.x << ' ' << point.y << ' ' << point.z;
    EXPECT_TRUE(point.transformBy(row.matrix.inverse()).isEqualTo(row.from));
    EXPECT_TRUE((row.matrix * row.matrix.inverse()).isEqualTo(TzGeMatrix3d::kIdentity));
    // Vectors follow the points that they lead between, so a translation does not move them.
    TzGeVector3d vector(1, -2, 0.5);
    TzGeVector3d const moved = row.matrix * (row.from + vector) - row.matrix * row.from;
    EXPECT_TRUE(vector.transformBy(row.matrix).isEqualTo(moved));
    EXPECT_FALSE(row.matrix.isSingular());
}
INSTANTIATE_TEST_SUITE_P(Rows, Matrices, testing::ValuesIn(kMatrices), [](auto const& row) {
    return row.param.name;
});

TEST(MatrixChecks, FlatOnesAreSingularAndHaveNoInverse) {
    TzGeMatrix3d const flat[] = {
        TzGeMatrix3d::projection(TzGePlane(), TzGeVector3d::kZAxis),
        systemOf({1, 2, 3}, {1, 0, 0}, {2, 0, 0}, {0, 0, 1}),
        systemOf({1, 2, 3}, {1, 0, 0}, {0, 0, 0}, {0, 0, 1}),
        TzGeMatrix3d::scaling(0),
    };
    for (TzGeMatrix3d const& each : flat) {
        EXPECT_TRUE(each.isSingular());
        EXPECT_TRUE(each.inverse().isEqualTo(TzGeMatrix3d::kIdentity));
    }
}

TEST(MatrixChecks, ShapesAreKeptByTurnsMirrorsAndScales) {
    TzGeMatrix3d const turn = TzGeMatrix3d::rotation(1.1, {1, 2, 3}, {4, 5, 6});
    EXPECT_TRUE((turn * TzGeMatrix3d::scaling(1e-8)).isUniScaledOrtho());
    EXPECT_NEAR((turn * TzGeMatrix3d::scaling(1e8)).scale(), 1e8, 1e-6);
    EXPECT_TRUE(systemOf({}, {-1, 0, 0}, {0, 1, 0}, {0, 0, 1}).isUniScaledOrtho());
    EXPECT_FALSE(systemOf({}, {1, 0, 0}, {1e-9, 1, 0}, {0, 0, 1}).isUniScaledOrtho());
    EXPECT_FALSE(systemOf({}, {2, 0, 0}, {0, 1, 0}, {0, 0, 1}).isUniScaledOrtho());
    EXPECT_FALSE(TzGeMatrix3d::scaling(0).isUniScaledOrtho());
}

struct ProjectionCase {
    char const* name;
    TzGeVector3d direction;
    TzGePoint3d from;
    TzGePoint3d to;
};
// On the plane z = 2.
constexpr ProjectionCase kProjections[] = {
    {"Straight", {0, 0, 1}, {3, 4, 9}, {3, 4, 2}},
    {"Against", {0, 0, -5}, {3, 4, 9}, {3, 4, 2}},
    {"Slanted", {1, 0, 1}, {3, 4, 9}, {-4, 4, 2}},
    {"OnThePlaneStays", {1, 2, 3}, {3, 4, 2}, {3, 4, 2}},
    {"AlongThePlaneStays", {1, 2, 0}, {3, 4, 9}, {3, 4, 9}},
    {"NoDirectionStays", {0, 0, 0}, {3, 4, 9}, {3, 4, 9}},
};
class Projections : public testing::TestWithParam<ProjectionCase> {};
TEST_P(Projections, PointsAndMatricesAgree) {
    auto const& row = GetParam();
    TzGePlane const plane({7, 7, 2}, TzGeVector3d::kZAxis);
    EXPECT_TRUE(row.from.project(plane, row.direction).isEqualTo(row.to));
    EXPECT_TRUE((TzGeMatrix3d::projection(plane, row.direction) * row.from).isEqualTo(row.to));
    TzGeVector3d const vector = row.from - TzGePoint3d(0, 0, 2);
    EXPECT_TRUE(vector.project(plane, row.direction).isEqualTo(row.to - TzGePoint3d(0, 0, 2)));
}
INSTANTIATE_TEST_SUITE_P(Rows, Projections, testing::ValuesIn(kProjections), [](auto const& row) {
    return row.param.name;
});

// The smallest and largest coordinates on one line.
std::string extremesOf(TzGeBoundBlock3d const& block) {
    TzGePoint3d low;
    TzGePoint3d high;
    block.getMinMaxPoints(low, high);
    std::string text;
    for (TzGePoint3d const& p : {low, high}) {
        for (int i = 0; i < 3; ++i)
            text += std::to_string(std::lround(p[i] * 100)) + (i < 2 ? "," : " ");
    }
    return text;
}

TEST(Blocks, KeepTheCornerTheyWereGiven) {
    TzGeBoundBlock3d const block({15, 22, 0}, {25, 18, 0});
    TzGePoint3d base;
    TzGeVector3d sides[3];
    block.get(base, sides[0], sides[1], sides[2]);
    EXPECT_TRUE(base.isEqualTo({15, 22, 0}));
    EXPECT_TRUE(sides[0].isEqualTo({10, 0, 0}));
    EXPECT_TRUE(sides[1].isEqualTo({0, -4, 0}));
    EXPECT_TRUE(sides[2].isEqualTo({0, 0, 0}));
    EXPECT_EQ(extremesOf(block), "1500,1800,0 2500,2200,0 ");
    EXPECT_TRUE(block.isBox());
}

TEST(Blocks, ReachAsFarAsTheirTurnedCorners) {
    TzGeBoundBlock3d block({0, 0, 0}, {4, 0, 0}, {0, 2, 0}, {0, 0, 0});
    block.transformBy(TzGeMatrix3d::rotation(kPi / 2, TzGeVector3d::kZAxis, {1, 1, 0}));
    EXPECT_EQ(extremesOf(block), "0,0,0 200,400,0 ");
    // The first side runs along Y now.
    EXPECT_FALSE(block.isBox());
    block.transformBy(TzGeMatrix3d::rotation(kPi / 4, TzGeVector3d::kZAxis));
    EXPECT_EQ(extremesOf(block), "-283,0,0 141,424,0 ");
}

TEST(Blocks, GrowFromNothing) {
    TzGeBoundBlock3d block;
    EXPECT_TRUE(block.isEmpty());
    EXPECT_FALSE(block.contains(TzGePoint3d::kOrigin));
    EXPECT_EQ(extremesOf(block.transformBy(TzGeMatrix3d::translation({5, 5, 5}))), "0,0,0 0,0,0 ");
    block.extend(TzGeBoundBlock3d());
    EXPECT_TRUE(block.isEmpty());
    block.extend(TzGePoint3d(5, 5, 5)).extend(TzGePoint3d(3, 6, 5));
    EXPECT_EQ(extremesOf(block), "300,500,500 500,600,500 ");
    block.extend(TzGeBoundBlock3d({4, 4, 4}, {9, 5, 5}));
    EXPECT_EQ(extremesOf(block), "300,400,400 900,600,500 ");
    EXPECT_TRUE(block.contains({3 - 0.9e-10, 5, 5}));
    EXPECT_FALSE(block.contains({3 - 1.1e-9, 5, 5}));
}

}  // namespace
