#pragma once

#include "tz/ge/point3d.h"
#include "tz/gi/draw.h"

class TzDbEntity;

// What entities of this host and its displays agree on beyond the drawing interface.
//
// A display may want to know which entity is drawn rather than what it looks like: the frames of a
// drag tell entities by their kind and place. So each entity of the host begins its drawing with
//
//   if (tzhost::takenWhole(draw, *this, L"MTEXT", location())) return true;
namespace tzhost {

// Fill types. With the page's colour a polygon hides what lies below it and shows nothing itself.
inline constexpr int kFillNothing = 0;
inline constexpr int kFillColor = 1;
inline constexpr int kFillPage = 2;

// A display that takes entities whole.
class EntityTaker {
public:
    virtual ~EntityTaker() = default;
    // Whether the display took the entity, which then draws nothing itself. `type` is its name in
    // drawing files; `position` the point that places it.
    virtual bool
    takeEntity(TzDbEntity const& entity, wchar_t const* type, TzGePoint3d const& position) = 0;
};

// Asks the display that receives what `draw` draws; false when it takes no entities.
[[nodiscard]] bool takenWhole(TzGiCommonDraw* draw,
                              TzDbEntity const& entity,
                              wchar_t const* type,
                              TzGePoint3d const& position);

}  // namespace tzhost
