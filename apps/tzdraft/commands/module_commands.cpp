#include <unistd.h>

#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/program_session.h"
#include "apps/tzdraft/program_texts.h"
#include "host/command_line/command_line.h"
#include "host/files/file_bytes.h"
#include "host/text/utf8.h"

namespace tzdraft {
namespace {

// Loading comes after the command, too late to ask a person again. A script is told then.
bool isThere(Answer<std::filesystem::path> const& name) {
    std::string const file = ProgramSession::current().moduleCalled(name.value).string();
    if (!tzhost::commandLine().isPerson() || access(file.c_str(), R_OK) == 0) return true;
    tzhost::commandLine().sayProblem(tzhost::fromUtf8(file + ": " + localText("cannot be read") +
                                                      ": " + tzhost::systemReason()));
    return false;
}

}  // namespace

void loadCommand() {
    ProgramSession& session = ProgramSession::current();
    auto const file = askUntil(
        [&] {
            return askFile(localText(L"Module to load"), session.moduleName(),
                           session.moduleFolder());
        },
        isThere);
    if (file.asked == Asked::given) session.loadLater(file.value);
}

void unloadCommand() {
    ProgramSession::current().unloadLater();
}

}  // namespace tzdraft
