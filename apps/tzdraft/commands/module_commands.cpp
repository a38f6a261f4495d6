#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/program_session.h"
#include "apps/tzdraft/program_texts.h"

namespace tzdraft {

void loadCommand() {
    auto const file = askFile(localText(L"Module to load"), ProgramSession::current().moduleName());
    if (file) ProgramSession::current().loadLater(*file);
}

void unloadCommand() {
    ProgramSession::current().unloadLater();
}

}  // namespace tzdraft
