#pragma once

#include <csignal>
#include <sys/types.h>
#include <termios.h>

// The terminal while a program has it: that of standard input, else the one that this process was
// started from, unless the process is in the background there. Without a terminal nothing happens.
namespace tzhost {

class LentTerminal {
public:
    LentTerminal();
    LentTerminal(LentTerminal const&) = delete;
    LentTerminal& operator=(LentTerminal const&) = delete;
    // Takes the terminal back with the settings that it had.
    ~LentTerminal();

    [[nodiscard]] bool isThere() const { return terminal_ >= 0; }
    // Makes a group of processes the one that reads keys and gets their signals.
    void giveTo(pid_t group) const;
    // In the program's process: puts the terminal, else an empty file, in the place of standard
    // input, from which a script may come. No program is to read its lines.
    void becomeInput() const;

private:
    int terminal_;  // -1 for none; not standard input itself, which a signal may close meanwhile
    termios settings_{};
    struct sigaction before_ {};
};

}  // namespace tzhost
