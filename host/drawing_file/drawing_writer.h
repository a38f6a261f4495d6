#pragma once

#include "host/database/drawing.h"
#include "host/files/safe_file.h"

namespace tzhost::drawingfile {

// Writes a drawing with the variables in force to an open file, piece by piece. False when the file
// refuses a piece, whose reason it then knows.
[[nodiscard]] bool writeWhole(Drawing& drawing, SafeFile& file);

}  // namespace tzhost::drawingfile
