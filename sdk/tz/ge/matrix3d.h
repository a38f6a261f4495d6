#pragma once

#include "tz/ge/point3d.h"

// A transformation of space that keeps straight lines straight and parallel lines parallel: four
// rows and columns, applied to column vectors. The first three columns are where the axes go, the
// last is where the origin goes. A plain value.
//
//   TzGeMatrix3d userToWorld;
//   userToWorld.setCoordSystem(origin, xAxis, yAxis, zAxis);
//   point.transformBy(userToWorld.inverse());            // world to user
//   TzGeMatrix3d both = second * first;                  // `first` applies first
class TzGeMatrix3d {
public:
    static const TzGeMatrix3d kIdentity;

    // The identity.
    constexpr TzGeMatrix3d() = default;

    // Each of these makes a new matrix. Angles are in radians, anticlockwise as seen against the
    // axis; the axis may have any length, and about a zero one nothing turns.
    [[nodiscard]] static TZ_API TzGeMatrix3d translation(TzGeVector3d const& offset);
    [[nodiscard]] static TZ_API TzGeMatrix3d rotation(
        double angle, TzGeVector3d const& axis, TzGePoint3d const& centre = TzGePoint3d::kOrigin);
    [[nodiscard]] static TZ_API TzGeMatrix3d
    scaling(double factor, TzGePoint3d const& centre = TzGePoint3d::kOrigin);
    // Moves every point along a direction onto the plane. The identity when the direction runs
    // along the plane or is zero; singular otherwise.
    [[nodiscard]] static TZ_API TzGeMatrix3d projection(TzGePlane const& plane,
                                                        TzGeVector3d const& direction);

    TzGeMatrix3d& setToIdentity() { return *this = TzGeMatrix3d(); }
    // Maps coordinates of a system to the coordinates in which its origin and axes are given. The
    // axes are taken as they are: neither their lengths nor their angles are put right.
    TZ_API TzGeMatrix3d& setCoordSystem(TzGePoint3d const& origin,
                                        TzGeVector3d const& xAxis,
                                        TzGeVector3d const& yAxis,
                                        TzGeVector3d const& zAxis);
    TZ_API void getCoordSystem(TzGePoint3d& origin,
                               TzGeVector3d& xAxis,
                               TzGeVector3d& yAxis,
                               TzGeVector3d& zAxis) const;
    // The columns, one by one.
    [[nodiscard]] constexpr TzGeVector3d xAxis() const { return axis(0); }
    [[nodiscard]] constexpr TzGeVector3d yAxis() const { return axis(1); }
    [[nodiscard]] constexpr TzGeVector3d zAxis() const { return axis(2); }
    [[nodiscard]] constexpr TzGePoint3d origin() const {
        return {entry[0][3], entry[1][3], entry[2][3]};
    }

    // The row and the column count from 0 to 3 and are not checked.
    [[nodiscard]] double operator()(int row, int column) const { return entry[row][column]; }
    [[nodiscard]] double& operator()(int row, int column) { return entry[row][column]; }

    // The transformation that applies `right` first and this one then.
    TZ_API TzGeMatrix3d operator*(TzGeMatrix3d const& right) const;
    TzGeMatrix3d& preMultBy(TzGeMatrix3d const& left) { return *this = left * *this; }
    TzGeMatrix3d& postMultBy(TzGeMatrix3d const& right) { return *this = *this * right; }
    TzGePoint3d operator*(TzGePoint3d point) const { return point.transformBy(*this); }
    TzGeVector3d operator*(TzGeVector3d vector) const { return vector.transformBy(*this); }

    // The transformation back; the identity when there is none.
    [[nodiscard]] TZ_API TzGeMatrix3d inverse() const;
    // The volume of a unit cube after the transformation; negative when the transformation mirrors.
    [[nodiscard]] TZ_API double det() const;
    // Space is flattened: the axes, each taken at length 1, span no more volume than the vector
    // tolerance, or one of them is exactly zero. So a uniform scale, however small, is not
    // singular.
    [[nodiscard]] TZ_API bool isSingular(TzGeTol const& tol = TzGeContext::gTol) const;
    // The axes have one length and stand at right angles: shapes keep their form.
    [[nodiscard]] TZ_API bool isUniScaledOrtho(TzGeTol const& tol = TzGeContext::gTol) const;
    // The length of the longest axis.
    [[nodiscard]] TZ_API double scale() const;
    // The axes differ by no more than the vector tolerance, the origins by no more than that of
    // points.
    [[nodiscard]] TZ_API bool isEqualTo(TzGeMatrix3d const& other,
                                        TzGeTol const& tol = TzGeContext::gTol) const;
    bool operator==(TzGeMatrix3d const& other) const { return isEqualTo(other); }
    bool operator!=(TzGeMatrix3d const& other) const { return !isEqualTo(other); }

    // Rows of columns; the last row stays 0, 0, 0, 1.
    double entry[4][4] = {{1, 0, 0, 0}, {0, 1, 0, 0}, {0, 0, 1, 0}, {0, 0, 0, 1}};

private:
    [[nodiscard]] constexpr TzGeVector3d axis(int i) const {
        return {entry[0][i], entry[1][i], entry[2][i]};
    }
};

inline constexpr TzGeMatrix3d TzGeMatrix3d::kIdentity{};
