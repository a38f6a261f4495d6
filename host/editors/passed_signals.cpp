#include "host/editors/passed_signals.h"

#include <cerrno>

namespace tzhost {
namespace {

std::array<struct sigaction, PassedSignals::kSignals.size()> before;
volatile pid_t programGroup = 0;
volatile std::sig_atomic_t postponed = 0;  // a signal whose default waits; 0 for none

void pass(int signal) {
    int const problem = errno;  // of what the signal came into
    if (programGroup > 0) (void)kill(-programGroup, signal);
    for (std::size_t i = 0; i < before.size(); ++i) {
        if (PassedSignals::kSignals[i] != signal) continue;
        if (before[i].sa_handler == SIG_DFL) {
            postponed = signal;
        } else {
            before[i].sa_handler(signal);
        }
    }
    errno = problem;
}

}  // namespace

// A signal that is ignored, as nohup has it, stays ignored.
PassedSignals::PassedSignals() {
    programGroup = 0;
    postponed = 0;
    // One that comes before the program's group is known would be passed to nobody.
    sigset_t signals;
    sigemptyset(&signals);
    for (int const each : kSignals)
        sigaddset(&signals, each);
    sigprocmask(SIG_BLOCK, &signals, &blockedBefore_);
    struct sigaction action {};
    action.sa_handler = pass;
    for (std::size_t i = 0; i < kSignals.size(); ++i) {
        sigaction(kSignals[i], nullptr, &before[i]);
        if (before[i].sa_handler != SIG_IGN) sigaction(kSignals[i], &action, nullptr);
    }
}

void PassedSignals::release() const noexcept {
    sigprocmask(SIG_SETMASK, &blockedBefore_, nullptr);
}

void PassedSignals::forget() const noexcept {
    for (std::size_t i = 0; i < kSignals.size(); ++i)
        if (before[i].sa_handler != SIG_IGN) std::signal(kSignals[i], SIG_DFL);
    release();
}

void PassedSignals::passTo(pid_t group) {
    programGroup = group;
    release();
}

PassedSignals::~PassedSignals() {
    release();
    for (std::size_t i = 0; i < kSignals.size(); ++i)
        sigaction(kSignals[i], &before[i], nullptr);
    if (postponed != 0) (void)std::raise(postponed);
}

}  // namespace tzhost
