#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/problem.h"
#include "apps/tzdraft/program_session.h"
#include "apps/tzdraft/program_texts.h"
#include "tz/ed/print.h"

namespace tzdraft {

void undoCommand() {
    if (!ProgramSession::current().undo())
        tellProblem(localText(L"There is nothing to take back."));
}

}  // namespace tzdraft
