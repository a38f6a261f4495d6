#pragma once

#include "host/base/safe_file.h"
#include "host/database/drawing.h"

namespace tzhost::drawingfile {

// Writes a drawing with the variables in force to an open file, piece by piece. False when the file
// refuses a piece, whose reason it then knows.
[[nodiscard]] bool writeWhole(Drawing& drawing, SafeFile& file);

}  // namespace tzhost::drawingfile
