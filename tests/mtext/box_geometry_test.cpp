// The dragged text box as geometry: corners, attachment points, edges, arrows and the sample's
// place.

#include "module/mtext/box_geometry.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <string>

namespace {

constexpr double kQuarterTurn = 1.5707963267948966;

UserAxes worldTurned(double angle) {
    return UserAxes{TzGeVector3d::kXAxis, TzGeVector3d::kYAxis, TzGeVector3d::kZAxis}.turned(angle);
}

std::string show(double value) {
    char text[40];
    std::snprintf(text, sizeof text, "%.6g", value > -1e-9 && value < 1e-9 ? 0.0 : value);
    return text;
}

std::string show(TzGePoint3d const& p) {
    std::string text = show(p.x) + "," + show(p.y);
    return p.z == 0 ? text : text + "," + show(p.z);
}

std::string show(BoxCorners const& c) {
    return "TL " + show(c.topLeft) + " TR " + show(c.topRight) + " BL " + show(c.bottomLeft) +
           " BR " + show(c.bottomRight);
}

std::string show(BoxEdge const& edge) {
    return show(edge.from) + " to " + show(edge.to);
}

BoxCorners boxOf(TzGePoint3d const& base, TzGePoint3d const& point, UserAxes const& frame) {
    BoxCorners corners;
    stretchBox(corners, base, point, frame);
    return corners;
}

struct DragRow {
    char const* name;
    double angle;
    TzGePoint3d base;
    TzGePoint3d point;
    char const* corners;
};

// However the drag goes, the box has the same corners; a turned frame has its own up and left.
DragRow const kDrags[] = {
    {"DownRight", 0, {1, 1, 0}, {5, -1, 0}, "TL 1,1 TR 5,1 BL 1,-1 BR 5,-1"},
    {"DownLeft", 0, {5, 1, 0}, {1, -1, 0}, "TL 1,1 TR 5,1 BL 1,-1 BR 5,-1"},
    {"UpRight", 0, {1, -1, 0}, {5, 1, 0}, "TL 1,1 TR 5,1 BL 1,-1 BR 5,-1"},
    {"UpLeft", 0, {5, -1, 0}, {1, 1, 0}, "TL 1,1 TR 5,1 BL 1,-1 BR 5,-1"},
    {"Right", 0, {1, 1, 0}, {5, 1, 0}, "TL 1,1 TR 5,1 BL 1,1 BR 5,1"},
    {"Left", 0, {1, 1, 0}, {-5, 1, 0}, "TL -5,1 TR 1,1 BL -5,1 BR 1,1"},
    {"Up", 0, {1, 1, 0}, {1, 4, 0}, "TL 1,4 TR 1,4 BL 1,1 BR 1,1"},
    {"Nowhere", 0, {1, 1, 0}, {1, 1, 0}, "TL 1,1 TR 1,1 BL 1,1 BR 1,1"},
    {"OffThePlane", 0, {1, 1, 0}, {5, -1, 7}, "TL 1,1 TR 5,1 BL 1,-1 BR 5,-1"},
    {"OnAHigherPlane", 0, {1, 1, 2}, {5, -1, 0}, "TL 1,1,2 TR 5,1,2 BL 1,-1,2 BR 5,-1,2"},
    {"QuarterTurned", kQuarterTurn, {0, 0, 0}, {2, 4, 0}, "TL 0,0 TR 0,4 BL 2,0 BR 2,4"},
    {"ThreeQuartersTurned", 3 * kQuarterTurn, {0, 0, 0}, {2, 4, 0}, "TL 2,4 TR 2,0 BL 0,4 BR 0,0"},
};

class Drags : public testing::TestWithParam<DragRow> {};
TEST_P(Drags, GiveCorners) {
    DragRow const& row = GetParam();
    EXPECT_EQ(show(boxOf(row.base, row.point, worldTurned(row.angle))), row.corners);
}
INSTANTIATE_TEST_SUITE_P(Directions, Drags, testing::ValuesIn(kDrags), [](auto const& row) {
    return row.param.name;
});

// Of a box from 0,0 to 4,-2 with a sample 1.5 wide and 0.5 high.
struct AttachmentRow {
    int attachment;
    char const* point;
    char const* sample;
    char const* verticalSample;
};
constexpr AttachmentRow kAttachments[] = {
    {0, "0,0", "0,-0.5", "0.25,0"},        {1, "0,0", "0,-0.5", "0.25,0"},
    {2, "2,0", "1.25,-0.5", "1.25,-0.5"},  {3, "4,0", "2.5,-0.5", "2.5,-0.5"},
    {4, "0,-1", "0,-0.5", "0.25,0"},       {5, "2,-1", "1.25,-0.5", "1.25,-0.5"},
    {6, "4,-1", "2.5,-0.5", "2.5,-0.5"},   {7, "0,-2", "0,-0.5", "0.25,0"},
    {8, "2,-2", "1.25,-0.5", "1.25,-0.5"}, {9, "4,-2", "2.5,-0.5", "2.5,-0.5"},
    {10, "0,0", "0,-0.5", "0.25,0"},
};

TEST(Attachments, PlaceTextAndSample) {
    UserAxes const frame = worldTurned(0);
    BoxCorners const box = boxOf({0, 0, 0}, {4, -2, 0}, frame);
    for (AttachmentRow const& row : kAttachments) {
        SCOPED_TRACE(row.attachment);
        EXPECT_EQ(show(attachmentPoint(box, frame.x * 4, frame.y * 2, row.attachment)), row.point);
        auto const sample = [&](LineFlow flow) {
            return show(samplePosition(box, frame, flow, row.attachment, 0.5, 1.5));
        };
        EXPECT_EQ(sample(LineFlow::horizontal), row.sample);
        EXPECT_EQ(sample(LineFlow::vertical), row.verticalSample);
    }
}

struct FlowRow {
    LineFlow flow;
    char const* edges;
    char const* arrow;  // at the top edge, of size 1
};
constexpr FlowRow kFlows[] = {
    {LineFlow::horizontal, "sides 0,-2 to 0,0 4,0 to 4,-2 top 0,0 to 4,0 bottom 0,-2 to 4,-2",
     "2,-0.5 2.5,-1 2.25,-1 2.25,-1.5 1.75,-1.5 1.75,-1 1.5,-1 2,-0.5"},
    {LineFlow::vertical, "sides 4,0 to 0,0 0,-2 to 4,-2 top 0,-2 to 0,0 bottom 4,-2 to 4,0",
     "0.5,-1 1,-0.5 1,-0.75 1.5,-0.75 1.5,-1.25 1,-1.25 1,-1.5 0.5,-1"},
};

TEST(Flows, TurnTheRolesOfTheEdges) {
    UserAxes const frame = worldTurned(0);
    BoxCorners const box = boxOf({0, 0, 0}, {4, -2, 0}, frame);
    for (FlowRow const& row : kFlows) {
        BoxEdges const edges = edgesOf(box, row.flow);
        EXPECT_EQ("sides " + show(edges.sides[0]) + " " + show(edges.sides[1]) + " top " +
                      show(edges.top) + " bottom " + show(edges.bottom),
                  row.edges);
        std::string outline;
        for (TzGePoint3d const& point : arrowOutline(edges.top, frame, row.flow, 1))
            outline += (outline.empty() ? "" : " ") + show(point);
        EXPECT_EQ(outline, row.arrow);
    }
}

}  // namespace
