#pragma once

#include <optional>
#include <vector>

#include "tz/db/object_id.h"
#include "tz/ge/matrix3d.h"
#include "tz/ge/plane.h"
#include "tz/text/array.h"

// Which texts take part in an alignment, and the axes they are aligned in: the plane and the
// reading direction that most of them share. Of equals the first one met wins.

[[nodiscard]] bool isTheSamePlane(TzGePlane const& a, TzGePlane const& b);
// The X axes run along one line, in either sense; the Y axes are not looked at.
[[nodiscard]] bool isCoordSystemParalle(TzGeMatrix3d const& a, TzGeMatrix3d const& b);

// Texts by the plane that they lie in.
//
//   TextPlanes planes;
//   planes.insert(plane, id);      // for each text
//   use(planes.majority());
class TextPlanes {
public:
    // A text belongs to each plane met so far that is the same as its own within the tolerance,
    // which may be several.
    void insert(TzGePlane const& plane, TzDbObjectId id);
    // The texts of the plane that was the first to reach the highest count, in order of insertion.
    [[nodiscard]] std::vector<TzDbObjectId> majority() const;

private:
    struct Group {
        TzGePlane plane;
        std::vector<TzDbObjectId> ids;
    };

    void add(int index, TzDbObjectId id);
    void recordMajority(int count, int index);

    std::vector<Group> groups_;
    int best_ = -1;       // the highest count
    int bestIndex_ = -1;  // of the group that reached it first
};

// The systems that texts propose, by the direction of their X axes.
class TextAxes {
public:
    void insert(TzGeMatrix3d const& system);
    // The first system of the largest group; nothing when none was proposed.
    [[nodiscard]] std::optional<TzGeMatrix3d> majority() const;

private:
    struct Group {
        TzGeMatrix3d system;
        int count;
    };
    std::vector<Group> groups_;
};
