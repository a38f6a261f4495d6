#include <filesystem>

#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/local_text.h"
#include "apps/tzdraft/session.h"
#include "tz/ed/print.h"

namespace tzdraft {
namespace {

void printError(std::string const& error) {
    tzutPrintf(L"\n%ls\n", TzString::fromUtf8(error).kwszPtr());
}

// Asks for a file and hands it to an operation of the session.
template <class Operation>
void withFile(wchar_t const* question, TzString const& defaultFile, Operation operation) {
    Answer<TzString> const file = askText(question, defaultFile);
    if (file.asked != Asked::given) return;
    std::string error;
    if (!operation(std::filesystem::path(file.value.toUtf8()), error)) printError(error);
}

}  // namespace

void newCommand() {
    Session::current().makeNew();
}

void openCommand() {
    withFile(localText(L"Drawing to open"), TzString(),
             [](std::filesystem::path const& file, std::string& error) {
                 return Session::current().open(file, error);
             });
}

void saveCommand() {
    TzString const present = TzString::fromUtf8(Session::current().drawing().file().string());
    withFile(localText(L"Save drawing as"), present,
             [](std::filesystem::path const& file, std::string& error) {
                 return Session::current().save(file, error);
             });
}

void plotCommand() {
    withFile(localText(L"File to plot to"), TzString(),
             [](std::filesystem::path const& file, std::string& error) {
                 return Session::current().plot(file, error);
             });
}

void quitCommand() {
    Session::current().quit();
}

}  // namespace tzdraft
