#pragma once

// The signals that ask the program to end, SIGTERM and SIGHUP, as a wish that the session looks at:
// it ends in order and writes its results. There is one at a time; before and after it the signals
// do what they did.
//
// What waits for standard input then meets its end: the signal puts /dev/null in its place, since
// readers take an interrupted call up again.
namespace tzdraft {

class EndSignals {
public:
    EndSignals();
    EndSignals(EndSignals const&) = delete;
    EndSignals& operator=(EndSignals const&) = delete;
    ~EndSignals();

    // The signal that came, 0 for none.
    [[nodiscard]] static int caught();
};

}  // namespace tzdraft
