#include <algorithm>
#include <map>
#include <sstream>
#include <unistd.h>

#include "apps/tzdraft/commands/ask.h"
#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/choices.h"
#include "apps/tzdraft/commands/problem.h"
#include "apps/tzdraft/help_topics.h"
#include "apps/tzdraft/program_texts.h"
#include "apps/tzdraft/screen_columns.h"
#include "host/command_line/command_line.h"
#include "host/runtime/command_stack.h"
#include "host/runtime/documents.h"
#include "tz/ed/print.h"

namespace tzdraft {
namespace {

constexpr std::size_t kNameWidth = 16;
constexpr std::size_t kLeastRoom = 20;  // for a line; where there is less, it stays whole

// A line broken at blanks, so that it fits on a person's screen after `indent` columns.
std::wstring fitted(std::wstring_view text, std::size_t indent) {
    std::size_t const columns = tzhost::commandLine().isPerson() ? screenColumns(STDOUT_FILENO) : 0;
    std::wstring shown;
    if (columns >= indent + kLeastRoom) {
        while (text.size() > columns - indent) {
            std::size_t const blank = text.rfind(L' ', columns - indent);
            if (blank == text.npos) break;
            shown += std::wstring(text.substr(0, blank)) + L'\n' + std::wstring(indent, L' ');
            text.remove_prefix(blank + 1);
        }
    }
    return shown.append(text);
}

// Help files break long sentences into lines of their own width; a person's screen has another.
std::wstring unbroken(std::wstring text) {
    if (!tzhost::commandLine().isPerson()) return text;
    for (std::size_t at = text.find(L'\n', 1); at != text.npos; at = text.find(L'\n', at + 1)) {
        if (text[at - 1] != L'.') text[at] = L' ';
    }
    return text;
}

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
        tzutPrintf(L"\n%ls%ls %ls", name.c_str(), blanks.c_str(), fitted(text, width + 1).c_str());
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
        std::wistringstream lines(unbroken(text));
        for (std::wstring line; std::getline(lines, line);)
            tzutPrintf(L"\n%ls", fitted(line, 0).c_str());
        tzutPrintf(L"\n");
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
