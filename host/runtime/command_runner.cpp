#include "host/runtime/command_runner.h"

#include "host/base/event_sink.h"
#include "host/base/memory_faults.h"
#include "host/runtime/command_stack.h"
#include "host/settings/variables.h"

namespace tzhost {
namespace {

// Bits of CMDACTIVE.
constexpr int kCommandActive = 1;
constexpr int kAnsweredByScript = 4;

std::vector<CommandHooks>& hooks() {
    static std::vector<CommandHooks> all;
    return all;
}

Audit& worst() {
    static Audit left;
    return left;
}

void reportPhase(Command const& command, char const* phase) {
    reportEvent([&] {
        return Event{{"event", "command"}, {"name", utf8(command.globalName)}, {"phase", phase}};
    });
}

void reportAudit(Audit const& left) {
    reportEvent([&] {
        return Event{{"event", "audit"},
                     {"openObjects", left.openObjects},
                     {"selectionSets", left.selectionSets},
                     {"filters", left.filters},
                     {"gestureHandlers", left.gestureHandlers},
                     {"highlighted", left.highlighted},
                     {"ucsStack", left.ucsStack},
                     {"keywordCallback", left.keywordCallback}};
    });
}

void setActive(int bits) {
    // The host may write it and the value is within the limits, so there is nothing to answer for.
    (void)Variables::instance().set(L"CMDACTIVE", VariableValue(static_cast<short>(bits)),
                                    Writer::host);
}

// One run of a command, ended on every way out.
class Run {
public:
    Run(Command const& command, AnswersFrom answers) : command_(command) {
        setActive(kCommandActive + (answers == AnswersFrom::script ? kAnsweredByScript : 0));
        reportPhase(command_, "begin");
        for (CommandHooks const& each : hooks()) {
            if (each.begin) each.begin(command_);
        }
    }
    Run(Run const&) = delete;
    Run& operator=(Run const&) = delete;
    ~Run() {
        for (auto each = hooks().rbegin(); each != hooks().rend(); ++each) {
            if (each->end) each->end(command_);
        }
        setActive(0);
        reportPhase(command_, "end");
    }

private:
    Command const command_;  // a copy: the command may unload its own module
};

// The audit of what runs meanwhile, on every way out.
class Audited {
public:
    Audited() = default;
    Audited(Audited const&) = delete;
    Audited& operator=(Audited const&) = delete;
    ~Audited() {
        reportAudit(audit());
        if (!audit().clean()) worst() = audit();
    }
};

}  // namespace

void addCommandHooks(CommandHooks added) {
    hooks().push_back(std::move(added));
}
void clearCommandHooks() {
    hooks().clear();
}

Audit runCommand(Command const& command, AnswersFrom answers) {
    {
        Audited const isAudited;
        Run const run(command, answers);
        MemoryFaultScope const memory;
        command.callback();
    }
    return audit();
}

Audit runFunction(std::function<void()> const& call) {
    {
        Audited const isAudited;
        MemoryFaultScope const memory;
        call();
    }
    return audit();
}

Audit const& worstAudit() {
    return worst();
}
void resetWorstAudit() {
    worst() = Audit();
}

}  // namespace tzhost
