#pragma once

// The names in the tables of a drawing, for completion. No object is opened, so that asking costs
// the command at hand nothing.

#include <string>
#include <vector>

#include "tz/db/object_id.h"

namespace tzhost {

// The names of a table's records, in its order; none for the null id. The spaces, whose names begin
// with "*", are left out.
[[nodiscard]] std::vector<std::wstring> symbolNames(TzDbObjectId table);

}  // namespace tzhost
