#pragma once

#include <optional>
#include <string_view>
#include <vector>

#include "host/selection/entity_list.h"
#include "tz/ge/matrix3d.h"

// What a user picks: by a point in user coordinates, or by handles in a script.
namespace tzhost {

// A picked entity and the block references around it, outermost first; `placed` maps the
// coordinates of the innermost one's block to world coordinates. `top` is what stands in the space
// itself.
struct Picked {
    TzDbObjectId top;
    TzDbObjectId id;
    std::vector<TzDbObjectId> references;
    TzGeMatrix3d placed;
};

enum class Depth { top, nested };

// The newest entity of the active space whose box holds the point; with `nested`, the newest one
// inside it when that is a block reference. Nothing where there is none.
[[nodiscard]] std::optional<Picked> pickAt(TzGePoint3d const& user, Depth depth);

// "#2A", or "#2A/2B" for an entity inside a block reference, as deep as it goes. Nothing when the
// text has another form, or names what is not there.
[[nodiscard]] std::optional<Picked> pickByHandles(std::wstring_view text);

// Whether the text begins as handles do.
[[nodiscard]] bool isHandles(std::wstring_view text);

}  // namespace tzhost
