#include "apps/tzdraft/command_loop.h"

#include <exception>
#include <vector>

#include "apps/tzdraft/commands/bodies.h"
#include "apps/tzdraft/commands/choices.h"
#include "apps/tzdraft/commands/host_commands.h"
#include "apps/tzdraft/commands/unsaved.h"
#include "apps/tzdraft/function_call.h"
#include "apps/tzdraft/program_session.h"
#include "apps/tzdraft/program_texts.h"
#include "host/base/audit.h"
#include "host/command_line/command_line.h"
#include "host/runtime/command_runner.h"
#include "host/runtime/command_stack.h"
#include "host/runtime/words.h"
#include "host/selection/entity_list.h"
#include "host/selection/selection_sets.h"
#include "host/text/system_words.h"
#include "host/text/utf8.h"

namespace tzdraft {
namespace {

bool isCall(std::wstring const& line) {
    return line.front() == L'(';
}

// Whether the line means something that can be run.
bool isKnown(std::wstring const& line) {
    return isCall(line) || tzhost::commandStack().find(TzString(line)) != nullptr;
}

// Answers do not follow a command on its line, though who tries it still is told which one it is.
void tellUnknown(std::wstring const& line) {
    TzString said = TzString::formatted(localText(L"There is no command \"%ls\"."), line.c_str());
    said += nearCommand(line.substr(0, line.find(L' '))).c_str();
    said += TzString::formatted(localText(L" %ls lists all."), localText(L"HELP"));
    tzhost::commandLine().sayProblem(said.str());
}

// A script that ends at problems ends here, too.
void tellLeftOver(std::wstring const& line) {
    if (tzhost::commandLine().isPerson()) return;
    tzhost::commandLine().sayProblem(
        TzString::formatted(localText(L"%ls left something open."), line.c_str()).str());
}

// Whether the end of the input is that of the session. A person who ended it by Ctrl-D may stay.
bool endsHere() {
    tzhost::CommandLine& line = tzhost::commandLine();
    line.setVoice(tzhost::CommandLine::Voice::host);
    bool const isOver = line.hasEnded() || mayLeave();
    line.setVoice(tzhost::CommandLine::Voice::module);
    if (!isOver) line.goOn();
    return isOver;
}

}  // namespace

void CommandLoop::hook() {
    tzhost::addCommandHooks({[this](tzhost::Command const& command) { beginCommand(command); },
                             [this](tzhost::Command const& command) { endCommand(command); }});
}

// A call is taken back as a command is.
void CommandLoop::runCall(std::wstring const& line) {
    session_.beginCommand(line);
    tzhost::commandLine().setVoice(tzhost::CommandLine::Voice::function);
    try {
        tzhost::runFunction([&] { callTyped(line); });
    } catch (...) {
        endCall();
        throw;
    }
    endCall();
}

void CommandLoop::endCall() {
    session_.endCommand();
    tzhost::commandLine().setVoice(tzhost::CommandLine::Voice::module);
}

void CommandLoop::runTyped(std::wstring const& line) {
    if (isCall(line)) return runCall(line);
    tzhost::Command const* const command = tzhost::commandStack().find(TzString(line));
    if (!command) return tellUnknown(line);
    auto const answers =
        tzhost::commandLine().isPerson() ? tzhost::AnswersFrom::user : tzhost::AnswersFrom::script;
    tzhost::runCommand(*command, answers);
}

void CommandLoop::runGuarded(std::wstring const& line) {
    try {
        runTyped(line);
        session_.doPostponed();
    } catch (std::exception const& problem) {
        tzhost::commandLine().sayProblem(line + localText(L" ended early: ") +
                                         tzhost::fromUtf8(tzhost::systemWords(problem)));
    }
    tzhost::freeAllSets();  // the audit has counted them
    if (strict_ == Strict::yes && !tzhost::worstAudit().clean()) tellLeftOver(line);
}

// Nothing when the session ends.
std::optional<std::wstring> CommandLoop::nextLine() const {
    tzhost::CommandLine& line = tzhost::commandLine();
    while (!session_.wantsToEnd()) {
        auto text =
            line.readCommand(line.isPerson() ? commandNames() : std::vector<std::wstring>());
        if (text || endsHere()) return text;
    }
    return std::nullopt;
}

// Enter alone repeats the command before it where a person types, but no mistyped one; in a script
// it does nothing.
void CommandLoop::run() {
    std::wstring last;
    while (auto const typed = nextLine()) {
        std::wstring const line(tzhost::withoutBlanksAround(*typed));
        if (line.empty()) {
            if (!last.empty() && tzhost::commandLine().isPerson()) runGuarded(last);
            continue;
        }
        last = isKnown(line) ? line : std::wstring();
        runGuarded(line);
    }
}

// What a command of the program prints is no event, and one that does not look at the selection
// made before it begins without one.
void CommandLoop::beginCommand(tzhost::Command const& command) {
    bool const isOwn = command.group == TzString(kHostCommandGroup);
    tzhost::commandLine().setVoice(isOwn ? tzhost::CommandLine::Voice::host
                                         : tzhost::CommandLine::Voice::module);
    if ((command.flags & tzhost::Command::kUsesImpliedSelection) == 0) {
        tzhost::dropImpliedSelection();
    }
    session_.beginCommand(command.localName.str());
}

void CommandLoop::endCommand(tzhost::Command const& command) {
    session_.endCommand();
    if (command.callback != selectCommand) tzhost::dropImpliedSelection();
    tzhost::commandLine().setVoice(tzhost::CommandLine::Voice::module);
}

}  // namespace tzdraft
