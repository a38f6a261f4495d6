#pragma once

// The extensions of texts and text styles, see tz/db/extensions.h.
namespace tzhost {

// Puts them on their classes.
void addDatabaseExtensions();

}  // namespace tzhost
