#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/local_text.h"
#include "apps/tzdraft/session.h"
#include "tz/ed/print.h"

namespace tzdraft {

void undoCommand() {
    if (!Session::current().undo()) tzutPrintf(localText(L"\nThere is nothing to take back.\n"));
}

}  // namespace tzdraft
