#include <map>

#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/help_topics.h"
#include "host/runtime/command_stack.h"
#include "tz/ed/print.h"

namespace tzdraft {
namespace {

void listCommands() {
    std::map<std::wstring, std::wstring> byName;
    for (tzhost::Command const& each : tzhost::commandStack().commands()) {
        byName[each.globalName.str()] = each.localName.str();
    }
    for (auto const& [global, local] : byName) {
        std::wstring const text = helpFor(global);
        std::wstring const name = local == global ? global : local + L" (_" + global + L")";
        tzutPrintf(L"\n%-16ls %ls", name.c_str(), text.substr(0, text.find(L'\n')).c_str());
    }
    tzutPrintf(L"\n");
}

}  // namespace

void helpCommand() {
    Answer<TzString> const name = askText(L"Command, or Enter for the list");
    if (name.isCancelled()) return;
    if (name.asked == Asked::empty) return listCommands();
    tzhost::Command const* const command = tzhost::commandStack().find(name.value);
    std::wstring const text = helpFor(command ? command->globalName : name.value);
    if (text.empty()) {
        tzutPrintf(L"\nThere is no help on \"%ls\".\n", name.value.kwszPtr());
    } else {
        tzutPrintf(L"\n%ls\n", text.c_str());
    }
}

}  // namespace tzdraft
