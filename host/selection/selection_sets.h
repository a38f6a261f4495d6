#pragma once

#include "host/selection/entity_list.h"

// The selection sets that are lent out, by their names of two 64-bit integers. They count in the
// audit.
namespace tzhost {

// Names a new set. The name is never given again.
void nameNewSet(EntityIds ids, long long* name);
// A name of no set.
void nameNoSet(long long* name);
// The entities of a set as they were selected, erased ones included; null for a name of no set.
[[nodiscard]] EntityIds const* findSet(long long const* name);
// Frees the sets that a command did not free. Called when it has ended and its audit has counted
// them.
void freeAllSets();

}  // namespace tzhost
