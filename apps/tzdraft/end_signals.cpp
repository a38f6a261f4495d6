#include "apps/tzdraft/end_signals.h"

#include <array>
#include <cerrno>
#include <csignal>
#include <fcntl.h>
#include <unistd.h>

namespace tzdraft {
namespace {

constexpr std::array kSignals{SIGTERM, SIGHUP};

volatile std::sig_atomic_t signalCaught = 0;
int endOfInput = -1;  // /dev/null
std::array<struct sigaction, kSignals.size()> before;

void note(int signal) {
    int const problem = errno;  // of what the signal came into
    signalCaught = signal;
    (void)dup2(endOfInput, STDIN_FILENO);
    errno = problem;
}

}  // namespace

EndSignals::EndSignals() {
    signalCaught = 0;
    endOfInput = open("/dev/null", O_RDONLY | O_CLOEXEC);
    struct sigaction action {};
    action.sa_handler = note;
    for (std::size_t i = 0; i < kSignals.size(); ++i) {
        sigaction(kSignals[i], nullptr, &before[i]);
        // Whoever started the program with nohup wants it to outlive the terminal.
        if (before[i].sa_handler != SIG_IGN) sigaction(kSignals[i], &action, nullptr);
    }
}

EndSignals::~EndSignals() {
    for (std::size_t i = 0; i < kSignals.size(); ++i)
        sigaction(kSignals[i], &before[i], nullptr);
    close(endOfInput);
}

int EndSignals::caught() {
    return signalCaught;
}

}  // namespace tzdraft
