#include "host/database/command_undo.h"

#include "host/database/drawing.h"
#include "host/runtime/command_runner.h"

namespace tzhost {

void keepCommandsForUndo() {
    addCommandHooks({[](Command const&) {
                         if (Drawing* const drawing = workingDrawing()) drawing->undoLog().begin();
                     },
                     [](Command const&) {
                         if (Drawing* const drawing = workingDrawing()) drawing->undoLog().end();
                     }});
}

bool takeBackCommand() {
    Drawing* const drawing = workingDrawing();
    return drawing && drawing->undoLog().takeBack();
}

}  // namespace tzhost
