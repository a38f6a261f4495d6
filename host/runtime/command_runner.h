#pragma once

#include <functional>

#include "host/base/audit.h"

namespace tzhost {

struct Command;

// What other layers do around each command, such as marking the undo log. `begin` runs in the order
// of registration, `end` the other way round, also when the command passes an exception.
struct CommandHooks {
    std::function<void(Command const&)> begin;
    std::function<void(Command const&)> end;
};
void addCommandHooks(CommandHooks hooks);
void clearCommandHooks();

enum class AnswersFrom { user, script };

// Runs a command: CMDACTIVE, the hooks, the events, and the audit after it. Returns what the
// command left over; an exception of the command passes on after all of that.
Audit runCommand(Command const& command, AnswersFrom answers);

// Runs a call of a function, in which memory can fail as in a command, with an audit after it.
// Returns what it left over; an exception passes on after that.
Audit runFunction(std::function<void()> const& call);

// The audit after the last command or call that left something over; clean when none did.
[[nodiscard]] Audit const& worstAudit();
void resetWorstAudit();

}  // namespace tzhost
