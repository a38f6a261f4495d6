#pragma once

// Counts what is lent out while a command runs. Each layer counts its own loans up and down; after
// a command all of them must read as before it, whatever failed or was cancelled. Counting touches
// no object that nobody touched.
namespace tzhost {

struct Audit {
    int openObjects = 0;           // openings of database objects not yet closed
    int selectionSets = 0;         // sets not yet freed
    int filters = 0;               // selection filters installed
    int gestureHandlers = 0;       // overrule handlers installed
    int highlighted = 0;           // entities shown as selected by a command
    int ucsStack = 0;              // user systems waiting to be restored
    bool keywordCallback = false;  // a selection keyword callback is installed

    [[nodiscard]] bool clean() const;
};

// The process's counters, to be counted up and down where loans are given.
[[nodiscard]] Audit& audit();

}  // namespace tzhost
