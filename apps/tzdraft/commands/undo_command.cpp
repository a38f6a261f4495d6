#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/problem.h"
#include "apps/tzdraft/program_session.h"
#include "apps/tzdraft/program_texts.h"
#include "tz/ed/print.h"

namespace tzdraft {

void undoCommand() {
    auto const command = ProgramSession::current().undo();
    if (!command) return tellProblem(localText(L"There is nothing to take back."));
    tzutPrintf(localText(L"\n%ls is taken back.\n"), command->c_str());
}

void redoCommand() {
    auto const command = ProgramSession::current().redo();
    if (!command) return tellProblem(localText(L"There is nothing to do again."));
    tzutPrintf(localText(L"\n%ls is done again.\n"), command->c_str());
}

}  // namespace tzdraft
