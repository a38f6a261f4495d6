#pragma once

#include "tz/db/entity.h"

// Taking entities over into a drawing.
namespace tzhost {

// Whether the entities of `block` lead to `inner` through block references, `block` itself
// included.
[[nodiscard]] bool leadsTo(TzDbObjectRecord const& block, TzDbObjectRecord const& inner);

// Adds an entity, open for write, to a block or to a block reference that is open for write; a
// field in its text comes to life. On failure the entity stays the caller's.
[[nodiscard]] Tzad::ErrorStatus
appendEntity(TzDbObject& owner, TzDbObjectId& id, TzDbEntity* entity);

}  // namespace tzhost
