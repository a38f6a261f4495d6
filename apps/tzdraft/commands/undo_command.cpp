#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/program_session.h"
#include "apps/tzdraft/program_texts.h"
#include "tz/ed/print.h"

namespace tzdraft {

void undoCommand() {
    if (!ProgramSession::current().undo())
        tzutPrintf(localText(L"\nThere is nothing to take back.\n"));
}

}  // namespace tzdraft
