#include "apps/tzdraft/commands/unsaved.h"

#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/program_session.h"
#include "apps/tzdraft/program_texts.h"
#include "host/command_line/command_line.h"
#include "host/files/file_kind.h"
#include "host/text/utf8.h"

namespace tzdraft {
namespace {

// Says what it is about, and asks; no is the default.
bool isMeant(wchar_t const* what, std::wstring const& about, wchar_t const* question) {
    tzhost::commandLine().say(TzString::formatted(localText(what), about.c_str()).str());
    return askYesNo(localText(question), false).value;
}

std::wstring listed(std::vector<std::wstring> const& names) {
    std::wstring list;
    for (std::wstring const& each : names)
        list += (list.empty() ? L"" : L", ") + each;
    return list;
}

// Written before the session ends: when that fails, another file can still be named.
bool isSavedAtEnd() {
    ProgramSession& session = ProgramSession::current();
    if (session.fileAtEnd().empty()) return false;
    std::string error;
    bool const isSaved = session.save(session.fileAtEnd(), error);
    if (!isSaved) tzhost::commandLine().sayFailure(tzhost::fromUtf8(error));
    return isSaved;
}

}  // namespace

bool mayLeave() {
    if (!tzhost::commandLine().isPerson() || isSavedAtEnd()) return true;
    ProgramSession const& session = ProgramSession::current();
    std::vector<std::wstring> const names = session.unsaved();
    return names.empty() || isMeant(forLocalText(L"Changes are not saved: %ls."), listed(names),
                                    forLocalText(L"Quit without saving them?"));
}

bool mayReplace() {
    ProgramSession const& session = ProgramSession::current();
    if (!tzhost::commandLine().isPerson() || !session.fileAtEnd().empty()) return true;
    std::wstring const oldest = session.unsavedToDrop();
    return oldest.empty() ||
           isMeant(forLocalText(L"U keeps no more drawings; changes not saved would be lost: %ls."),
                   oldest, forLocalText(L"Go on without saving them?"));
}

bool mayOverwrite(std::filesystem::path const& file) {
    if (!tzhost::commandLine().isPerson() || !tzhost::isFile(file.string())) return true;
    OwnFiles::Standing const standing = ProgramSession::current().ownFiles().standingOf(file);
    wchar_t const* what = forLocalText(L"There is a file of that name: %ls.");
    if (tzhost::isReadOnly(file.string()))
        what = forLocalText(L"The file is read-only: %ls.");
    else if (standing == OwnFiles::Standing::own)
        return true;
    else if (standing == OwnFiles::Standing::changed)
        what = forLocalText(L"Somebody else has written to this file since: %ls.");
    return isMeant(what, tzhost::fromUtf8(file.string()), forLocalText(L"Replace it?"));
}

}  // namespace tzdraft
