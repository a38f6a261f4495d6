#pragma once

#include "tz/db/object_id.h"

// Selection sets by the names that the host gives them.

// How many entities a set holds; 0 also for a set that is not there.
[[nodiscard]] int lengthOf(long long const* set);
// The entity at an index; false when the host does not tell it.
[[nodiscard]] bool entityAt(long long const* set, int index, TzDbObjectId& id);

// Asks for every hook of a selection filter (tz/ed/selection_filter.h).
inline constexpr int kEveryHook = 15;
