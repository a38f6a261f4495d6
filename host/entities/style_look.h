#pragma once

#include "host/layout/layout_types.h"
#include "tz/db/object_id.h"

// What the layout needs of a text style.
namespace tzhost {

// The look of a style record. The null id means the style in force in the working drawing; with no
// drawing it is that of a new drawing.
[[nodiscard]] LayoutStyle lookOfStyle(TzDbObjectId style);

}  // namespace tzhost
