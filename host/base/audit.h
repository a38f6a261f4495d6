#pragma once

// Counts what is lent out while a command runs. Each layer counts its own loans up and down; after
// a command every count must be what it was before the command, also when a part of it failed or
// was cancelled. Only what lends and takes back changes a count: no object is visited to be
// counted.
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

// The counters of the process. Whoever lends something counts up, and counts down when it comes
// back.
[[nodiscard]] Audit& audit();

}  // namespace tzhost
