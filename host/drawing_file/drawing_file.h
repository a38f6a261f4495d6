#pragma once

#include <filesystem>
#include <memory>
#include <string>
#include <vector>

#include "host/database/drawing.h"
#include "host/files/safe_file.h"
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

// Reads a drawing; its file is set to `file`. Devices and pipes are refused at once.
[[nodiscard]] DrawingRead readDrawing(std::filesystem::path const& file);

// Puts the variables of the drawing kind to their defaults, then to these values. An empty list is
// what a new drawing starts with.
void setKeptVariables(Variables::Values const& values);

// Writes a drawing with the variables in force, whole or not at all (host/files/safe_file.h).
// Empty, or one line that says what went wrong; the old file is then as it was. A read-only file is
// refused unless the user was asked; isReadOnly (host/files/file_kind.h) tells it beforehand.
[[nodiscard]] std::string writeDrawing(Drawing& drawing,
                                       std::filesystem::path const& file,
                                       IfReadOnly ifReadOnly = IfReadOnly::refuse);

}  // namespace tzhost
