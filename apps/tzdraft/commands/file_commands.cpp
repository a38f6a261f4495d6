#include <filesystem>

#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/unsaved.h"
#include "apps/tzdraft/program_session.h"
#include "apps/tzdraft/program_texts.h"
#include "host/command_line/command_line.h"
#include "host/text/utf8.h"

namespace tzdraft {
namespace {

// The whole path, as far as the system tells.
std::wstring shownPath(std::filesystem::path const& file) {
    std::error_code unknown;
    std::filesystem::path const whole = std::filesystem::absolute(file, unknown);
    return tzhost::fromUtf8((unknown ? file : whole).lexically_normal().string());
}

using File = Answer<std::filesystem::path>;

// Hands a file to an operation of the session. A person is told what was done, since the name may
// have been proposed, completed or relative; a failure is told to everybody.
template <class Operation>
bool isDone(File const& file, wchar_t const* done, Operation operation) {
    tzhost::CommandLine& line = tzhost::commandLine();
    std::string error;
    if (!operation(file.value, error)) {
        line.sayFailure(tzhost::fromUtf8(error));
        return false;
    }
    if (line.isPerson())
        line.say(TzString::formatted(localText(done), shownPath(file.value).c_str()).str());
    return true;
}

bool isOpened(File const& file) {
    return !mayReplace() ||
           isDone(file, forLocalText(L"Opened: %ls."), [](auto const& from, std::string& error) {
               return ProgramSession::current().open(from, error);
           });
}

// A person has just been asked (mayOverwrite); nobody asks a script.
tzhost::IfReadOnly ifReadOnly() {
    return tzhost::commandLine().isPerson() ? tzhost::IfReadOnly::replace
                                            : tzhost::IfReadOnly::refuse;
}

bool isSaved(File const& file) {
    if (!mayOverwrite(file.value)) return true;
    return isDone(file, forLocalText(L"Saved: %ls."), [](auto const& to, std::string& error) {
        return ProgramSession::current().save(to, error, ifReadOnly());
    });
}

bool isPlotted(File const& file) {
    if (!mayOverwrite(file.value)) return true;
    std::vector<std::string> remarks;
    bool const isMade =
        isDone(file, forLocalText(L"Plotted: %ls."), [&](auto const& to, std::string& error) {
            return ProgramSession::current().plot(to, error, remarks, ifReadOnly());
        });
    for (std::string const& each : remarks)
        tzhost::commandLine().say(tzhost::fromUtf8(each));
    return isMade;
}

// Asks for a file until `isTaken`. A person leaves the question by an empty answer; a script that
// has no name to give has failed.
template <class Ask, class IsTaken>
void askUntilTaken(Ask ask, IsTaken isTaken) {
    Asked const asked = askUntil(ask, isTaken).asked;
    tzhost::CommandLine& line = tzhost::commandLine();
    if (asked == Asked::empty && !line.isPerson())
        line.sayFailure(localText(L"the file name is empty"));
}

}  // namespace

void newCommand() {
    if (mayReplace()) ProgramSession::current().makeNew();
}

void openCommand() {
    askUntilTaken([] { return askFile(localText(L"Drawing to open")); }, isOpened);
}

void saveCommand() {
    TzString const present =
        TzString::fromUtf8(ProgramSession::current().drawing().file().string());
    askUntilTaken([&] { return askFile(localText(L"Save drawing as"), present); }, isSaved);
}

void plotCommand() {
    askUntilTaken([] { return askFile(localText(L"File to plot to")); }, isPlotted);
}

void quitCommand() {
    if (mayLeave()) ProgramSession::current().quit();
}

}  // namespace tzdraft
