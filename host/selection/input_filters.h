#pragma once

#include "host/selection/entity_list.h"
#include "tz/ed/selection_filter.h"

// The filters that modules installed on the current document's input, as a selection runs them.
namespace tzhost {

// Bits of the flags with which a filter is installed: the hooks that it asks for.
constexpr int kAsksAboutAdding = 1;
constexpr int kAsksAboutRemoving = 2;
constexpr int kAsksAboutTheEnd = 4;

// Each shows entities to every filter in the order of installation, and leaves in `ids` what none
// of them took out. `set` is the set so far. Filters that go away meanwhile are called no more.
void filterAdded(EntityIds const& set, EntityIds& ids);
void filterRemoved(EntityIds const& set, EntityIds& ids);
void filterAtEnd(int status, EntityIds& set);

}  // namespace tzhost
