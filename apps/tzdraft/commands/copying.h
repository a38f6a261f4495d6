#pragma once

#include <memory>

#include "tz/db/block_table.h"
#include "tz/db/entity.h"
#include "tz/ge/matrix3d.h"

// Copies of entities in a block or a space.
namespace tzdraft {

// Puts a copy of the entity, with its field and its attributes, into the block, open for write;
// false when it cannot be there.
[[nodiscard]] bool
copyInto(TzDbBlockTableRecord& block, TzDbEntity const& entity, TzGeMatrix3d const& placed);

}  // namespace tzdraft
