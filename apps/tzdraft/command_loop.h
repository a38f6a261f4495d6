#pragma once

#include <optional>
#include <string>

namespace tzhost {
struct Command;
}

// Reads the lines at the command prompt and runs what they name, up to the end of the session.
//
//   CommandLoop loop(session, Strict::no);
//   loop.hook();   // before the first command, also one that a function of a module runs
//   loop.run();
namespace tzdraft {

class ProgramSession;

// Whether a script ends at what a command left open.
enum class Strict { no, yes };

class CommandLoop {
public:
    CommandLoop(ProgramSession& session, Strict strict) : session_(session), strict_(strict) {}
    CommandLoop(CommandLoop const&) = delete;
    CommandLoop& operator=(CommandLoop const&) = delete;

    // Lets each command begin and end as one of the session; tzhost::clearCommandHooks ends it.
    void hook();
    void run();

private:
    [[nodiscard]] std::optional<std::wstring> nextLine() const;
    void runGuarded(std::wstring const& line);
    void runTyped(std::wstring const& line);
    void runCall(std::wstring const& line);
    void endCall();
    void beginCommand(tzhost::Command const& command);
    void endCommand(tzhost::Command const& command);

    ProgramSession& session_;
    Strict strict_;
};

}  // namespace tzdraft
