#pragma once

#include "tz/ge/matrix3d.h"

// A block given by a base point and three sides, any of which may be zero; a box when the sides run
// along the axes. A plain value. A block that nothing was put into is empty: it reads as the origin
// with zero sides, and the first point that it is extended by becomes its base.
//
//   TzGeBoundBlock3d extents;
//   for (TzGePoint3d const& each : points) extents.extend(each);
//   extents.getMinMaxPoints(lowest, highest);
class TzGeBoundBlock3d {
public:
    TzGeBoundBlock3d() = default;
    TzGeBoundBlock3d(TzGePoint3d const& first, TzGePoint3d const& second) { set(first, second); }
    TzGeBoundBlock3d(TzGePoint3d const& base,
                     TzGeVector3d const& side1,
                     TzGeVector3d const& side2,
                     TzGeVector3d const& side3) {
        set(base, side1, side2, side3);
    }

    // The box between two opposite corners, whichever they are: the first becomes the base, and the
    // sides run along X, Y and Z from it.
    TZ_API TzGeBoundBlock3d& set(TzGePoint3d const& first, TzGePoint3d const& second);
    TZ_API TzGeBoundBlock3d& set(TzGePoint3d const& base,
                                 TzGeVector3d const& side1,
                                 TzGeVector3d const& side2,
                                 TzGeVector3d const& side3);
    TZ_API void
    get(TzGePoint3d& base, TzGeVector3d& side1, TzGeVector3d& side2, TzGeVector3d& side3) const;
    // The smallest and the largest coordinates of the eight corners.
    TZ_API void getMinMaxPoints(TzGePoint3d& smallest, TzGePoint3d& largest) const;

    [[nodiscard]] bool isEmpty() const { return empty_; }
    // Each side that is not zero runs along the axis of its number: the first along X and so on.
    [[nodiscard]] TZ_API bool isBox(TzGeTol const& tol = TzGeContext::gTol) const;
    // The point lies within the smallest and largest coordinates, taken wider by the point
    // tolerance.
    [[nodiscard]] TZ_API bool contains(TzGePoint3d const& point,
                                       TzGeTol const& tol = TzGeContext::gTol) const;

    // Makes this the smallest box that holds what it held and the point, or the other block too.
    TZ_API TzGeBoundBlock3d& extend(TzGePoint3d const& point);
    TZ_API TzGeBoundBlock3d& extend(TzGeBoundBlock3d const& other);
    // Transforms base and sides; an empty block stays empty.
    TZ_API TzGeBoundBlock3d& transformBy(TzGeMatrix3d const& matrix);

private:
    TzGePoint3d base_;
    TzGeVector3d sides_[3];
    bool empty_ = true;
};
