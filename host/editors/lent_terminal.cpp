#include "host/editors/lent_terminal.h"

#include <fcntl.h>
#include <unistd.h>

namespace tzhost {
namespace {

// A descriptor of the terminal that can be lent; -1 for none.
int openTerminal() {
    if (isatty(STDIN_FILENO) == 1) return fcntl(STDIN_FILENO, F_DUPFD_CLOEXEC, 0);
    int const terminal = open("/dev/tty", O_RDWR | O_CLOEXEC);
    if (terminal >= 0 && tcgetpgrp(terminal) == getpgrp()) return terminal;
    if (terminal >= 0) close(terminal);
    return -1;
}

}  // namespace

LentTerminal::LentTerminal() : terminal_(openTerminal()) {
    if (terminal_ < 0) return;
    tcgetattr(terminal_, &settings_);
    // The host is in the background while the program runs and must not be stopped for that.
    struct sigaction ignore {};
    ignore.sa_handler = SIG_IGN;
    sigaction(SIGTTOU, &ignore, &before_);
}

LentTerminal::~LentTerminal() {
    if (terminal_ < 0) return;
    tcsetpgrp(terminal_, getpgrp());
    tcsetattr(terminal_, TCSADRAIN, &settings_);
    sigaction(SIGTTOU, &before_, nullptr);
    close(terminal_);
    // Wherever the program left the cursor, what follows begins a line.
    if (isatty(STDOUT_FILENO) == 1) (void)!write(STDOUT_FILENO, "\r", 1);
}

void LentTerminal::giveTo(pid_t group) const {
    if (terminal_ >= 0) tcsetpgrp(terminal_, group);
}

void LentTerminal::becomeInput() const {
    if (isatty(STDIN_FILENO) == 1) return;
    int const input = terminal_ >= 0 ? terminal_ : open("/dev/null", O_RDONLY | O_CLOEXEC);
    (void)dup2(input, STDIN_FILENO);  // the copy stays open in the program
}

}  // namespace tzhost
