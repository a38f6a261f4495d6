#pragma once

// Where resource libraries are looked for. Set by whoever loads a module, before it is loaded.

#include <optional>
#include <string>

#include "host/resources/resource_file.h"

namespace tzhost {

struct ResourceSearch {
    std::string folder;  // the module's; empty: that of this host's libraries
    std::string locale;  // such as "de" or "de_AT"; empty: English
    std::string file;    // one file in place of every library; empty: none
};

// Replaces the search and returns the one before.
ResourceSearch setResourceSearch(ResourceSearch search);
// The one in force.
[[nodiscard]] ResourceSearch const& resourceSearch();

// The first library of that name that is there: in the folder of the locale, of its language, then
// in the folder itself, where the English one lies. Nothing when it is missing or damaged; a
// damaged one is not passed over for another.
[[nodiscard]] std::optional<ResourceFile> openResourceFile(std::wstring const& name);

}  // namespace tzhost
