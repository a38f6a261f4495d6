#pragma once

#include <array>
#include <csignal>
#include <sys/types.h>

// SIGTERM and SIGHUP while a program runs: both ask the session to end, which waits for the
// program, so the program gets them too. What the process did at these signals before it does as
// well; a default, which would end it, waits until this object ends. One object at a time.
namespace tzhost {

class PassedSignals {
public:
    PassedSignals();
    PassedSignals(PassedSignals const&) = delete;
    PassedSignals& operator=(PassedSignals const&) = delete;
    ~PassedSignals();

    // In the program's process, before it becomes the program: the signals end it.
    void forget() const noexcept;
    // The group of processes that the program leads, which gets the signals from now on. A signal
    // that came before waited until now.
    void passTo(pid_t group);

    static constexpr std::array kSignals{SIGTERM, SIGHUP, SIGINT};

private:
    void release() const noexcept;

    sigset_t blockedBefore_{};
};

}  // namespace tzhost
