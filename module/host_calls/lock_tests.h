#pragma once

class TzDbEntity;

// Whether an entity may be edited. The entity is open for read at least.

// False also when the layer cannot be opened.
[[nodiscard]] bool IsOnLockedLayer(TzDbEntity* entity);
// Whether the drawing has an active working set that the entity does not belong to; false for an
// entity in no drawing.
[[nodiscard]] bool IsLockedFromWorkingSet(TzDbEntity* entity);
