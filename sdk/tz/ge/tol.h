#pragma once

// How close two points or two vectors must be to count as equal. Both limits are absolute: points
// compare by their distance in drawing units, vectors by the length of their difference, and a
// vector no longer than the vector limit has no direction.
//
//   if (first.isEqualTo(second)) ...                  // within the host's global tolerance
//   if (first.isEqualTo(second, TzGeTol(1e-6))) ...   // within one's own
class TzGeTol {
public:
    constexpr TzGeTol() = default;
    // The same limit for points and for vectors; neither may be negative.
    constexpr explicit TzGeTol(double limit) : point_(limit), vector_(limit) {}
    constexpr TzGeTol(double point, double vector) : point_(point), vector_(vector) {}

    [[nodiscard]] constexpr double equalPoint() const { return point_; }
    [[nodiscard]] constexpr double equalVector() const { return vector_; }
    void setEqualPoint(double limit) { point_ = limit; }
    void setEqualVector(double limit) { vector_ = limit; }

private:
    double point_ = 1e-10;
    double vector_ = 1e-10;
};

// What all geometry shares.
class TzGeContext {
public:
    // The host's global tolerance, 1e-10 for points and for vectors; the default of every test.
    static const TzGeTol gTol;
};

inline constexpr TzGeTol TzGeContext::gTol{};
