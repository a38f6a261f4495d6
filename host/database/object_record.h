#pragma once

#include <cstdint>

class TzDbObject;
class TzRxClass;

namespace tzhost {
class Drawing;
}

// What an id points to: one object of a drawing, with the state of its openings. Records live as
// long as their drawing, those of erased objects included, and never move.
struct TzDbObjectRecord {
    TzDbObject* object = nullptr;        // owned by the drawing
    tzhost::Drawing* drawing = nullptr;  // never null
    TzDbObjectRecord* owner =
        nullptr;                // table, block, block reference or field's text that lists it
    std::uint64_t handle = 0;   // 0 only while a drawing is being read
    std::uint32_t notedIn = 0;  // the command whose undo step already knows this object
    std::uint16_t readers = 0;  // openings for read; 0 while it is open for write
    bool writer = false;        // open for write
    bool changed = false;       // since it was opened
    bool erased = false;
    bool inWorkingSet = true;
    bool highlighted = false;
};
