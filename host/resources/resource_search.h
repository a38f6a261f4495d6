#pragma once

// Where resource libraries are looked for. The caller that loads a module sets it beforehand.

#include <optional>
#include <string>

#include "host/resources/resource_file.h"

namespace tzhost {

struct ResourceSearch {
    std::string folder;  // of the module; empty: that of this host's libraries
    std::string locale;  // such as "de" or "de_AT"; empty: English
    std::string file;    // read in place of every library; empty: none
};

// Replaces the search and returns the previous one.
ResourceSearch setResourceSearch(ResourceSearch search);
// The one in force.
[[nodiscard]] ResourceSearch const& resourceSearch();

// The first library of that name in the folder of the locale, in that of its language, and in the
// folder itself, where the English one lies. Nothing when there is none, or when the first is
// damaged: another one is not tried then.
[[nodiscard]] std::optional<ResourceFile> openResourceFile(std::wstring const& name);

}  // namespace tzhost
