#pragma once

#include <cstdio>
#include <string_view>

#include "host/files/json_events.h"

// Reads the JSON of a drawing and hands over its parts as they come, so that no more than one
// entity is held as JSON.
namespace tzhost::drawingfile {

using Problem = JsonProblem;

// Takes the parts of a drawing. Values and names are gone when an operation returns; false from it
// stops the reading, and whoever gives it knows why.
class DrawingSink {
public:
    virtual ~DrawingSink() = default;
    // A member of the drawing that is neither "blocks" nor "entities".
    virtual bool member(std::string_view name, JsonValue const& value) = 0;
    // The parts of "blocks": between begin and end the members of one block, "entities" apart.
    virtual bool beginBlock(int line) = 0;
    virtual bool blockMember(std::string_view name, JsonValue const& value) = 0;
    virtual bool endBlock() = 0;
    // An element of "entities", of the block that is open, if one is, else of the drawing.
    virtual bool entity(JsonValue const& value) = 0;
    // An array of entities or of blocks is about to come.
    virtual void beginArray(std::string_view name) = 0;
};

// Reads the whole file. Nothing, or what stopped the reading on the side of the file: no JSON, not
// UTF-8, a member twice, nesting beyond 200 levels. `stopped` tells that the sink did.
struct StreamResult {
    bool stopped = false;
    bool failed = false;
    Problem problem;  // when it failed
};
[[nodiscard]] StreamResult readStream(std::FILE* file, DrawingSink& sink);

}  // namespace tzhost::drawingfile
