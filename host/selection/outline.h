#pragma once

#include <optional>
#include <vector>

#include "tz/db/object_id.h"
#include "tz/ge/matrix3d.h"
#include "tz/ge/point2d.h"

class TzDbEntity;

// Where an entity lies in the user system, for picks, windows and crossings: its lines, and the
// boxes of its texts as they are turned. What cannot be seen lies nowhere, nor does what goes
// beyond doubles. Nothing is opened.
//
//   Outline const outline = Outline::of(*entity);
//   if (outline.boxHolds(pick)) ...
namespace tzhost {

// A rectangle along the axes of the user system.
struct FlatBox {
    TzGePoint2d low;
    TzGePoint2d high;

    [[nodiscard]] static FlatBox between(TzGePoint2d const& a, TzGePoint2d const& b);
    [[nodiscard]] bool holds(TzGePoint2d const& point) const;
};

class Outline {
public:
    // `placed` maps the entity's coordinates to world coordinates, for one inside a block
    // reference.
    [[nodiscard]] static Outline of(TzDbEntity& entity,
                                    TzGeMatrix3d const& placed = TzGeMatrix3d::kIdentity);

    // The box around all of it; nothing for what lies nowhere.
    [[nodiscard]] std::optional<FlatBox> box() const;
    // Whether the point lies in that box; on the edge counts.
    [[nodiscard]] bool boxHolds(TzGePoint2d const& point) const;
    // Whether all of it lies in the box.
    [[nodiscard]] bool isWithin(FlatBox const& box) const;
    // Whether a part of it lies in the box; the inside of a text is a part of the text.
    [[nodiscard]] bool touches(FlatBox const& box) const;
    // Whether a line through points, one at least, meets a part of it; as touches() sees parts.
    [[nodiscard]] bool meets(std::vector<TzGePoint2d> const& line) const;

private:
    // What a path encloses; an inside that belongs to the entity makes the path a closed one.
    enum class Inside { empty, belongs };
    struct Path {
        std::vector<TzGePoint2d> points;
        Inside inside = Inside::empty;
    };

    std::vector<Path> paths_;
};

}  // namespace tzhost
