#pragma once

#include "tz/db/object_id.h"

// Selections of multi-line texts, by the names that the host gives to sets.

// The two codes under which a filter names the kind of an entity; the host takes both alike.
enum class KindCode : short { group = 0, result = 5020 };

// Selects multi-line texts alone, in a mode of tzedSSGet, with its status. Normal, the caller frees
// the set.
[[nodiscard]] int selectMText(long long* set, wchar_t const* mode, KindCode code);

// How many entities a set holds; 0 also for a set that is not there.
[[nodiscard]] int lengthOf(long long const* set);
// The entity at an index; false when the host does not tell it.
[[nodiscard]] bool entityAt(long long const* set, int index, TzDbObjectId& id);
