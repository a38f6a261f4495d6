#pragma once

#include <filesystem>
#include <memory>
#include <string>
#include <vector>

#include "host/database/drawing.h"
#include "host/settings/variables.h"

// Drawings in files, in the JSON form that docs/drawing-file.md describes. Both directions work
// entity by entity, so that a large drawing costs little more than its objects.
//
//   tzhost::DrawingRead read = tzhost::readDrawing("plan.json");
//   if (!read.drawing) complain(read.error);           // "plan.json:7: member "width": ..."
//   tzhost::setKeptVariables(read.variables);
//   tzhost::setWorkingDrawing(read.drawing.get());
//   ...
//   std::string const error = tzhost::writeDrawing(*read.drawing, "plan.json");
//
// Reading changes nothing but the drawing that it makes. A null drawing and an empty error never
// come together. Memory failures pass through, with the old file intact.
namespace tzhost {

struct DrawingRead {
    std::unique_ptr<Drawing> drawing;   // null when the file could not be read
    Variables::Values variables;        // what the file says of the variables that a drawing keeps
    std::vector<std::string> warnings;  // one line each
    std::string error;                  // one line: file, line, member, what was wrong and expected
    bool isNewer = false;               // the error is that the file is of a newer version
};

// Reads a drawing; its file is set to `file`.
[[nodiscard]] DrawingRead readDrawing(std::filesystem::path const& file);

// Puts the variables of the drawing kind to their defaults, then to these values. An empty list is
// what a new drawing starts with.
void setKeptVariables(Variables::Values const& values);

// Writes a drawing with the variables in force: to a temporary file in the same folder, flushed to
// the disk and renamed over the old file, so that a crash leaves the one or the other. Empty, or
// one line that says what went wrong; the old file is then as it was.
[[nodiscard]] std::string writeDrawing(Drawing& drawing, std::filesystem::path const& file);

}  // namespace tzhost
