#pragma once

#include "tz/db/object_id.h"

namespace tzdraft {

// What a question for a name answers to "?": the names in a table of the drawing, one a line.
void listNames(TzDbObjectId table);

}  // namespace tzdraft
