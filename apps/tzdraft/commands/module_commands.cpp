#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/local_text.h"
#include "apps/tzdraft/session.h"

namespace tzdraft {

void loadCommand() {
    auto const file = askFile(localText(L"Module to load"), Session::current().moduleName());
    if (file) Session::current().loadLater(*file);
}

void unloadCommand() {
    Session::current().unloadLater();
}

}  // namespace tzdraft
