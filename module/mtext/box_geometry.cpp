#include "module/mtext/box_geometry.h"

#include <utility>

#include "module/geometry/attachments.h"
#include "tz/ge/line3d.h"
#include "tz/ge/plane.h"

namespace {

// Gives the corners the names of the places at which they stand.
void putInOrder(BoxCorners& corners, UserAxes const& frame) {
    double const leftwards = (corners.topLeft - corners.topRight).dotProduct(frame.x);
    double const downwards = (corners.topLeft - corners.bottomLeft).dotProduct(frame.y);
    if (leftwards > 0) {
        std::swap(corners.topLeft, corners.topRight);
        std::swap(corners.bottomLeft, corners.bottomRight);
    }
    if (downwards < 0) {
        std::swap(corners.topLeft, corners.bottomLeft);
        std::swap(corners.topRight, corners.bottomRight);
    }
}

}  // namespace

void stretchBox(BoxCorners& corners,
                TzGePoint3d const& base,
                TzGePoint3d const& point,
                UserAxes const& frame) {
    corners.topLeft = base;
    corners.bottomRight = point.orthoProject(TzGePlane(base, frame.normal));
    TzGeLine3d const baseAlongX(base, frame.x);
    TzGeLine3d const baseAlongY(base, frame.y);
    TzGeLine3d const oppositeAlongX(corners.bottomRight, frame.x);
    TzGeLine3d const oppositeAlongY(corners.bottomRight, frame.y);
    baseAlongX.intersectWith(oppositeAlongY, corners.topRight, TzGeContext::gTol);
    oppositeAlongX.intersectWith(baseAlongY, corners.bottomLeft, TzGeContext::gTol);
    if (!corners.topLeft.isEqualTo(corners.bottomRight, TzGeContext::gTol))
        putInOrder(corners, frame);
}

TzGePoint3d attachmentPoint(BoxCorners const& corners,
                            TzGeVector3d const& width,
                            TzGeVector3d const& height,
                            int attachment) {
    BoxPlace const place = placeOfAttachment(attachment);
    bool const right = place.column == BoxColumn::right;
    TzGePoint3d point = place.row == BoxRow::bottom
                            ? (right ? corners.bottomRight : corners.bottomLeft)
                            : (right ? corners.topRight : corners.topLeft);
    if (place.column == BoxColumn::centre) point += width / 2;
    if (place.row == BoxRow::middle) point -= height / 2;
    return point;
}

BoxEdges edgesOf(BoxCorners const& corners, LineFlow flow) {
    auto const& [topLeft, bottomLeft, topRight, bottomRight] = corners;
    if (flow == LineFlow::vertical) {
        return {{{{topRight, topLeft}, {bottomLeft, bottomRight}}},
                {bottomLeft, topLeft},
                {bottomRight, topRight}};
    }
    return {{{{bottomLeft, topLeft}, {topRight, bottomRight}}},
            {topLeft, topRight},
            {bottomLeft, bottomRight}};
}

std::array<TzGePoint3d, 8>
arrowOutline(BoxEdge const& edge, UserAxes const& frame, LineFlow flow, double size) {
    bool const vertical = flow == LineFlow::vertical;
    TzGeVector3d const inwards = vertical ? frame.x : -frame.y;
    TzGeVector3d const sideways = vertical ? frame.y : frame.x;
    TzGePoint3d const middle = edge.from + (edge.to - edge.from) / 2;
    TzGePoint3d const tip = middle + inwards * (0.5 * size);
    TzGePoint3d const headEnd = middle + inwards * size;
    TzGePoint3d const shaftEnd = middle + inwards * (1.5 * size);
    TzGeVector3d const halfHead = sideways * (0.5 * size);
    TzGeVector3d const halfShaft = sideways * (0.25 * size);
    return {tip,
            headEnd + halfHead,
            headEnd + halfShaft,
            shaftEnd + halfShaft,
            shaftEnd - halfShaft,
            headEnd - halfShaft,
            headEnd - halfHead,
            tip};
}

TzGePoint3d samplePosition(BoxCorners const& corners,
                           UserAxes const& frame,
                           LineFlow flow,
                           int attachment,
                           double textSize,
                           double textWidth) {
    // Vertical text differs only at the left: it begins half its size to the right of the corner.
    switch (placeOfAttachment(attachment).column) {
    case BoxColumn::centre:
        return corners.topLeft + (corners.topRight - corners.topLeft) / 2 - frame.y * textSize -
               frame.x * (0.5 * textWidth);
    case BoxColumn::right: return corners.topRight - frame.y * textSize - frame.x * textWidth;
    case BoxColumn::left: break;
    }
    return flow == LineFlow::vertical ? corners.topLeft + frame.x * (0.5 * textSize)
                                      : corners.topLeft - frame.y * textSize;
}
