#pragma once

#include <string>
#include <vector>

#include "host/drawing_file/read_context.h"

namespace tzhost::drawingfile {

// A block reference whose block is not looked up yet: it may come later in the file.
struct OpenReference {
    TzDbObjectRecord* reference;
    std::wstring block;
    int line;
};

// Reads entities into a drawing.
class EntityReader {
public:
    explicit EntityReader(ReadContext& context) : context_(context) {}

    // An entity of the block `owner`; null for one of the drawing, which names its space itself.
    void read(JsonValue const& value, TzDbObjectRecord* owner);
    // When everything is read: looks up blocks, refuses blocks that hold themselves, and numbers
    // the entities that had no handle.
    void finish();

private:
    template <class Entity, class Imp>
    void readAs(JsonValue const& value, TzDbObjectRecord& owner);
    void readAttributes(JsonValue const* list, TzDbObjectRecord& reference);
    [[nodiscard]] TzDbObjectRecord& spaceOf(JsonValue const& value);
    [[nodiscard]] std::uint64_t handleOf(JsonValue const& value);
    void refuseCycles();

    ReadContext& context_;
    std::vector<OpenReference> references_;
    std::vector<TzDbObjectRecord*> unnumbered_;
};

}  // namespace tzhost::drawingfile
