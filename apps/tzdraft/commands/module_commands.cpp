#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/program_session.h"
#include "apps/tzdraft/program_texts.h"

namespace tzdraft {

void loadCommand() {
    ProgramSession& session = ProgramSession::current();
    auto const file =
        askFile(localText(L"Module to load"), session.moduleName(), session.moduleFolder());
    if (file.asked == Asked::given) session.loadLater(file.value);
}

void unloadCommand() {
    ProgramSession::current().unloadLater();
}

}  // namespace tzdraft
