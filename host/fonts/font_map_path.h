#pragma once

// Which font map file the process uses.

#include <string>

namespace tzhost {

// Replaces the shipped font map by another file, empty for the shipped one; returns the one before.
std::string setFontMapFile(std::string path);

}  // namespace tzhost
