#include <gtest/gtest.h>

#include <cstdio>
#include <string>

#include "tz/ge/line_seg3d.h"
#include "tz/ge/plane.h"

namespace {

// The coordinates to four digits.
std::string textOf(TzGePoint3d const& p) {
    char text[64];
    // Zero is added so that a negative one loses its sign.
    std::snprintf(text, sizeof text, "%.4g %.4g %.4g", p.x + 0.0, p.y + 0.0, p.z + 0.0);
    return text;
}

struct CrossingCase {
    char const* name;
    TzGePoint3d p;
    TzGeVector3d u;
    TzGePoint3d q;
    TzGeVector3d v;
    char const* at;  // empty for lines that do not cross
};
// name, first point and direction, second point and direction, crossing
constexpr CrossingCase kCrossings[] = {
    {"RightAngle", {1, 2, 0}, {1, 0, 0}, {5, 7, 0}, {0, 1, 0}, "5 2 0"},
    {"LongDirections", {1, 2, 0}, {1e8, 0, 0}, {5, 7, 0}, {0, -1e-8, 0}, "5 2 0"},
    {"Slanted", {0, 0, 0}, {1, 1, 1}, {4, 0, 2}, {-1, 1, 0}, "2 2 2"},
    {"SamePoint", {3, 3, 3}, {1, 0, 0}, {3, 3, 3}, {0, 0, 1}, "3 3 3"},
    {"OneDegreeApart", {0, 0, 0}, {0, 1, 0}, {1, 0, 0}, {-0.0174550649282, 1, 0}, "0 57.29 0"},
    {"Parallel", {0, 0, 0}, {1, 0, 0}, {0, 1, 0}, {-2, 0, 0}, ""},
    {"Same", {0, 0, 0}, {1, 0, 0}, {5, 0, 0}, {1, 0, 0}, ""},
    {"NoDirection", {0, 0, 0}, {1, 0, 0}, {0, 0, 0}, {0, 1e-11, 0}, ""},
    {"PassWithin", {0, 0, 0}, {1, 0, 0}, {2, 0, 0.9e-10}, {0, 1, 0}, "2 0 0"},
    {"PassBeyond", {0, 0, 0}, {1, 0, 0}, {2, 0, 1.1e-10}, {0, 1, 0}, ""},
};
class LineCrossings : public testing::TestWithParam<CrossingCase> {};
TEST_P(LineCrossings, AreFoundOrLeftAlone) {
    auto const& row = GetParam();
    TzGeLine3d const a(row.p, row.u);
    TzGeLine3d const b(row.q, row.v);
    TzGePoint3d at(-1, -1, -1);
    bool const cross = *row.at != 0;
    EXPECT_EQ(a.intersectWith(b, at), cross);
    EXPECT_EQ(textOf(at), cross ? row.at : "-1 -1 -1");
    EXPECT_EQ(b.intersectWith(a, at), cross);
}
INSTANTIATE_TEST_SUITE_P(Rows, LineCrossings, testing::ValuesIn(kCrossings), [](auto const& row) {
    return row.param.name;
});

// Far from the origin, rounding parts two lines of one tilted plane by more than the tolerance.
// They cross all the same.
TEST(Lines, CrossFarFromTheOrigin) {
    TzGeMatrix3d const tilt = TzGeMatrix3d::rotation(0.7, {1, 2, 3}, {4e8, -7e8, 1e8});
    TzGePoint3d const wanted = tilt * TzGePoint3d(9e8, 1e8, 0);
    TzGeLine3d const a(tilt * TzGePoint3d(-3e8, 1e8, 0), tilt * TzGeVector3d::kXAxis);
    TzGeLine3d const b(tilt * TzGePoint3d(9e8, 7e8, 0), tilt * TzGeVector3d::kYAxis);
    TzGePoint3d at;
    ASSERT_TRUE(a.intersectWith(b, at));
    EXPECT_LT(at.distanceTo(wanted), 1e-5);
}

TEST(Lines, MeasureFromTheirPoint) {
    TzGeLine3d const line(TzGePoint3d(1, 1, 0), TzGePoint3d(4, 5, 0));
    EXPECT_NEAR(line.paramOf({4, 5, 9}), 5.0, 1e-14);
    EXPECT_NEAR(line.paramOf({-2, -3, 0}), -5.0, 1e-14);
    EXPECT_TRUE(line.getClosestPointTo({4 - 4, 5 + 3, 7}).isEqualTo({4, 5, 0}));
    EXPECT_NEAR(line.distanceTo({4 - 4, 5 + 3, 12}), 13.0, 1e-14);
    EXPECT_TRUE(line.isOn({7, 9, 0.9e-10}));
    EXPECT_FALSE(line.isOn({7, 9, 1.1e-10}));
    TzGePoint3d const near(4, 5, 0.9e-10);
    EXPECT_EQ(line.getClosestPointTo(near).z, near.z);
}

TEST(Lines, MoveWithTheirSystem) {
    TzGeMatrix3d const system =
        TzGeMatrix3d().setCoordSystem({10, 0, 0}, {0, 2, 0}, {-2, 0, 0}, {0, 0, 2});
    TzGeLineSeg3d segment(TzGePoint3d(1, 0, 0), TzGePoint3d(4, 4, 0));
    segment.transformBy(system);
    EXPECT_TRUE(segment.startPoint().isEqualTo({10, 2, 0}));
    EXPECT_TRUE(segment.midPoint().isEqualTo({6, 5, 0}));
    EXPECT_NEAR(segment.length(), 10.0, 1e-14);
    EXPECT_TRUE(segment.direction().isEqualTo({-0.8, 0.6, 0}));
    EXPECT_NEAR(segment.line().paramOf(segment.endPoint()), 10.0, 1e-14);
    segment.transformBy(system.inverse());
    EXPECT_TRUE(segment.endPoint().isEqualTo({4, 4, 0}));
    TzGeLine3d const moved =
        TzGeLine3d(TzGePoint3d(0, 0, 0), TzGeVector3d(3, 0, 0)).transformBy(system);
    EXPECT_TRUE(moved.direction().isEqualTo({0, 1, 0}));
}

TEST(Lines, OfNoLengthHaveNoDirection) {
    TzGeLineSeg3d const point(TzGePoint3d(3, 3, 3), TzGePoint3d(3, 3, 3 + 1e-11));
    EXPECT_EQ(point.direction().length(), 0.0);
    EXPECT_EQ(point.line().paramOf({9, 9, 9}), 0.0);
    EXPECT_TRUE(point.line().getClosestPointTo({9, 9, 9}).isEqualTo({3, 3, 3}));
}

struct PlaneCase {
    char const* name;
    TzGePlane plane;
    TzGeVector3d normal;
    TzGePoint3d on;
    TzGePoint3d off;
    double distance;
};
const PlaneCase kPlanes[] = {
    {"World", TzGePlane(), {0, 0, 1}, {5, -5, 0.9e-10}, {0, 0, -2}, -2},
    {"PointAndNormal",
     TzGePlane({0, 0, 3}, TzGeVector3d(0, 0, -4)),
     {0, 0, -1},
     {9, 9, 3},
     {1, 1, 5},
     -2},
    {"OriginAndAxes",
     TzGePlane({1, 0, 0}, {0, 2, 0}, {0, 3, 5}),
     {1, 0, 0},
     {1, 7, 8},
     {4, 0, 0},
     3},
    {"ZeroNormal",
     TzGePlane({0, 0, 1}, TzGeVector3d()),
     {0, 0, 1},
     {3, 3, 1},
     {0, 0, 1 + 1.1e-10},
     1.1e-10},
    {"ParallelAxes",
     TzGePlane({0, 0, 1}, {1, 0, 0}, {-1, 0, 0}),
     {0, 0, 1},
     {3, 3, 1},
     {0, 0, 2},
     1},
};
class Planes : public testing::TestWithParam<PlaneCase> {};
TEST_P(Planes, KnowTheirPoints) {
    auto const& row = GetParam();
    EXPECT_TRUE(row.plane.normal().isEqualTo(row.normal));
    EXPECT_TRUE(row.plane.isOn(row.on));
    EXPECT_FALSE(row.plane.isOn(row.off));
    EXPECT_NEAR(row.plane.signedDistanceTo(row.off), row.distance, 1e-14);
    EXPECT_TRUE(row.plane.isOn(row.off.orthoProject(row.plane)));
    EXPECT_TRUE((row.off - row.off.orthoProject(row.plane)).isEqualTo(row.normal * row.distance));
    TzGePoint3d origin;
    TzGeVector3d x;
    TzGeVector3d y;
    row.plane.getCoordSystem(origin, x, y);
    EXPECT_TRUE(x.crossProduct(y).isCodirectionalTo(row.normal));
}
INSTANTIATE_TEST_SUITE_P(Rows, Planes, testing::ValuesIn(kPlanes), [](auto const& row) {
    return row.param.name;
});

TEST(PlaneUse, MeetsLinesThatReachIt) {
    TzGePlane const plane({0, 0, 2}, TzGeVector3d::kZAxis);
    TzGePoint3d at(-1, -1, -1);
    EXPECT_FALSE(plane.intersectWith(TzGeLine3d({0, 0, 2}, TzGeVector3d(1, 1, 0)), at));
    EXPECT_TRUE(at.isEqualTo({-1, -1, -1}));
    EXPECT_TRUE(plane.intersectWith(TzGeLine3d({0, 0, 0}, TzGeVector3d(1, 0, 1)), at));
    EXPECT_TRUE(at.isEqualTo({2, 0, 2}));
}

TEST(PlaneUse, MovesWithItsAxes) {
    TzGePlane plane({0, 0, 1}, TzGeVector3d(0, 1, 1));
    // Uneven scales turn a tilted normal: it follows the axes, not the scale.
    plane.transformBy(TzGeMatrix3d().setCoordSystem({}, {1, 0, 0}, {0, 1, 0}, {0, 0, 2}));
    EXPECT_TRUE(plane.pointOnPlane().isEqualTo({0, 0, 2}));
    EXPECT_TRUE(plane.normal().isCodirectionalTo({0, 2, 1}));
    plane.transformBy(TzGeMatrix3d::scaling(0));
    EXPECT_TRUE(plane.normal().isCodirectionalTo({0, 2, 1}));
}

}  // namespace
