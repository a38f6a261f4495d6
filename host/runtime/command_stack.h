#pragma once

#include <deque>

#include "tz/ed/command_stack.h"
#include "tz/text/string.h"

namespace tzhost {

// A registered command. Valid until its group is removed.
struct Command {
    TzString group;
    TzString globalName;
    TzString localName;
    int flags = 0;
    TzEdCommandStack::Callback callback = nullptr;

    // Bit of `flags`: the command sees the selection made before it.
    static constexpr int kUsesImpliedSelection = 2;
};

// All commands, in the order in which they came.
class CommandStack : public TzEdCommandStack {
public:
    int addCommand(wchar_t const* group,
                   wchar_t const* globalName,
                   wchar_t const* localName,
                   int flags,
                   Callback callback,
                   TzRxObject* reactor,
                   int sequence,
                   TzRxResourceInstance const& resources,
                   void* data) override;
    int removeGroup(wchar_t const* group) override;

    // The command that a typed name means: a local name first, then a global one, without regard to
    // case; "." and "_" before the name are skipped, and "_" admits the global name alone. Null
    // when there is none.
    [[nodiscard]] Command const* find(TzString const& typed) const;
    [[nodiscard]] std::deque<Command> const& commands() const { return commands_; }

private:
    std::deque<Command> commands_;
};

[[nodiscard]] CommandStack& commandStack();

// The topic that tzedSetFunHelp registered under a name, without regard to case; null when nothing
// was.
[[nodiscard]] TzString const* findHelp(TzString const& name);

}  // namespace tzhost
