#pragma once

#include <string>

struct TzDbObjectRecord;

namespace tzhost::drawingfile {

// Whether an entity says in which space it lies; those of blocks and references do not.
enum class Named { asSpace, notAtAll };

// Appends an entity as JSON, an INSERT with its attributes.
void writeEntity(std::string& out, TzDbObjectRecord const& entity, Named space);

}  // namespace tzhost::drawingfile
