#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/local_text.h"
#include "apps/tzdraft/session.h"

namespace tzdraft {

void loadCommand() {
    Answer<TzString> const file =
        askText(localText(L"Module to load"), Session::current().moduleName());
    if (file.asked == Asked::given) Session::current().loadLater(file.value.toUtf8());
}

void unloadCommand() {
    Session::current().unloadLater();
}

}  // namespace tzdraft
