#pragma once

#include "tz/db/object_id.h"
#include "tz/text/array.h"

class TzDbEntity;

// Entities that are kept from one question to the next, and those of the active space.
namespace tzhost {

using EntityIds = TzArray<TzDbObjectId>;

// Entities of one drawing. Reading the list leaves out what has been erased, and gives nothing when
// another drawing is worked on by now.
class KeptEntities {
public:
    KeptEntities() = default;
    explicit KeptEntities(EntityIds ids);
    [[nodiscard]] EntityIds read() const;

private:
    long long drawing_ = 0;
    EntityIds ids_;
};

// The entities of the active space in drawing order; empty while no drawing is open.
[[nodiscard]] EntityIds entitiesOfActiveSpace();
// The newest one, or none.
[[nodiscard]] EntityIds newestEntity();
// Those of both spaces.
[[nodiscard]] EntityIds entitiesOfAllSpaces();
// Whether the entity stands in the active space itself, not inside a reference.
[[nodiscard]] bool isInActiveSpace(TzDbObjectId id);

// The entity of an id without opening it; null for what is erased or no entity.
[[nodiscard]] TzDbEntity* entityOf(TzDbObjectId id);
[[nodiscard]] bool isOnLockedLayer(TzDbObjectId id);

// The selection that the next command may take over, and the one that the word "previous" means.
void setImpliedSelection(EntityIds ids);
void dropImpliedSelection();
[[nodiscard]] EntityIds impliedSelection();
void setPreviousSelection(EntityIds ids);
[[nodiscard]] EntityIds previousSelection();

}  // namespace tzhost
