#pragma once

#include <optional>

#include "host/selection/outline.h"

namespace tzhost {

// Two corners of a window or a crossing, asked for one after the other; a drag shows the box
// between the first and the cursor. Without a box when Enter was given instead of one of them.
struct AskedBox {
    std::optional<FlatBox> box;
};

// Nothing after a cancel.
[[nodiscard]] std::optional<AskedBox> askBox();

}  // namespace tzhost
