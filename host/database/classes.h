#pragma once

#include "tz/rx/class.h"
#include "tz/text/string.h"

// The runtime classes of the database and the kinds of entities.
namespace tzhost {

// Registers every class of this layer with its extensions; calls after the first do nothing.
void registerDatabaseClasses();

// What drawings, filters and lists call an entity of that class, such as "MTEXT"; empty for a class
// without such a name.
[[nodiscard]] TzString entityKind(TzRxClass const* descriptor);

}  // namespace tzhost
