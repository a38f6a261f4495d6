#pragma once

// Texts of a suite's own in place of the module's. The module reads its resource library once in a
// process, so a suite has one set of texts:
//
//   int const texts = ownTexts({{1, L"a {LUNITS}"}});   // at namespace scope

#include "host/resources/resource_file.h"

// Writes the library and makes the host find it. Returns how many texts it holds.
int ownTexts(tzhost::ResourceTexts const& texts);
