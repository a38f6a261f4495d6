#include <algorithm>
#include <map>

#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/choices.h"
#include "apps/tzdraft/commands/problem.h"
#include "apps/tzdraft/help_topics.h"
#include "apps/tzdraft/program_texts.h"
#include "host/runtime/command_stack.h"
#include "host/runtime/documents.h"
#include "tz/ed/print.h"

namespace tzdraft {
namespace {

constexpr std::size_t kNameWidth = 16;

// By the name as it is shown: the local one, and the global one where that is another.
void listCommands() {
    std::map<std::wstring, std::wstring> helpByName;
    std::size_t width = kNameWidth;
    for (tzhost::Command const& each : tzhost::commandStack().commands()) {
        std::wstring name = each.localName.str();
        if (each.localName != each.globalName) name += L" (_" + each.globalName.str() + L")";
        width = std::max(width, name.size());
        std::wstring const text = helpFor(each.globalName);
        helpByName[name] = text.substr(0, text.find(L'\n'));
    }
    for (auto const& [name, text] : helpByName) {
        std::wstring const blanks(width - name.size(), L' ');
        tzutPrintf(L"\n%ls%ls %ls", name.c_str(), blanks.c_str(), text.c_str());
    }
    tzutPrintf(L"\n");
}

// The name under which a command or a function is there now; empty for anything else. Topics
// outlive the module that registered them, and its help file tells about more than it registers.
TzString registeredName(TzString const& typed) {
    if (auto const* const command = tzhost::commandStack().find(typed)) return command->globalName;
    tzhost::Document const* const document = tzhost::documents().current();
    auto const* const function = document ? document->functions.find(typed) : nullptr;
    return function ? function->name : TzString();
}

bool isTold(Answer<TzString> const& name) {
    if (name.value == L"?") {
        listCommands();
        return true;
    }
    TzString const registered = registeredName(name.value);
    std::wstring const text = registered.isEmpty() ? std::wstring() : helpFor(registered);
    if (!text.empty()) {
        tzutPrintf(L"\n%ls\n", text.c_str());
        return true;
    }
    tellProblem(
        L"%ls%ls",
        TzString::formatted(localText(L"There is no help on \"%ls\"."), name.value.kwszPtr())
            .kwszPtr(),
        nearCommand(name.value.str()).c_str());
    return false;
}

}  // namespace

void helpCommand() {
    Answer<TzString> const name = askUntil(
        [] { return askName(localText(L"Command, or Enter for the list"), offerCommands()); },
        isTold);
    if (name.asked == Asked::empty) listCommands();
}

}  // namespace tzdraft
