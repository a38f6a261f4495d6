#pragma once

// Which font map file the process uses.

#include <string>

namespace tzhost {

// Replaces the shipped font map by another file; an empty path brings the shipped one back. Returns
// the previous path.
std::string setFontMapFile(std::string path);

}  // namespace tzhost
