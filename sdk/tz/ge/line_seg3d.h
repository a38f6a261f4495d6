#pragma once

#include "tz/ge/line3d.h"

// A straight stretch between two points. A plain value.
//
//   TzGeLineSeg3d baseline(first, second);
//   TzGePoint3d middle = baseline.midPoint();
class TzGeLineSeg3d {
public:
    // From the world's origin to 1,0,0.
    TzGeLineSeg3d() = default;
    TzGeLineSeg3d(TzGePoint3d const& start, TzGePoint3d const& end) : start_(start), end_(end) {}
    TzGeLineSeg3d(TzGePoint3d const& start, TzGeVector3d const& along)
        : start_(start), end_(start + along) {}

    TzGeLineSeg3d& set(TzGePoint3d const& start, TzGePoint3d const& end) {
        return *this = TzGeLineSeg3d(start, end);
    }

    [[nodiscard]] TzGePoint3d startPoint() const { return start_; }
    [[nodiscard]] TzGePoint3d endPoint() const { return end_; }
    [[nodiscard]] TzGePoint3d midPoint() const { return start_ + (end_ - start_) / 2.0; }
    // The start.
    [[nodiscard]] TzGePoint3d pointOnLine() const { return start_; }
    // From start to end, of length 1, or exactly zero.
    [[nodiscard]] TzGeVector3d direction() const { return line().direction(); }
    [[nodiscard]] double length() const { return start_.distanceTo(end_); }
    // The unbounded line along this stretch; its parameter is 0 at the start.
    [[nodiscard]] TzGeLine3d line() const { return TzGeLine3d(start_, end_); }
    TZ_API TzGeLineSeg3d& transformBy(TzGeMatrix3d const& matrix);

private:
    TzGePoint3d start_;
    TzGePoint3d end_{1.0, 0.0, 0.0};
};
