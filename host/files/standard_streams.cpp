#include "host/files/standard_streams.h"

#include <cerrno>

#include <fcntl.h>
#include <unistd.h>

namespace tzhost {

namespace {

constexpr int kNone = -1;  // writing there fails

int resultOutput = STDOUT_FILENO;

}  // namespace

// A file gets the lowest number that is free, so that each goes where it is missing.
void openStandardStreams() {
    for (int const each : {STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO}) {
        if (fcntl(each, F_GETFD) >= 0) continue;
        (void)open("/dev/null", O_RDWR);
        if (each == STDOUT_FILENO) resultOutput = kNone;
    }
}

void keepStandardOutput() {
    constexpr int kAboveStreams = 3;
    int const kept =
        resultOutput == kNone ? kNone : fcntl(STDOUT_FILENO, F_DUPFD_CLOEXEC, kAboveStreams);
    bool const isKept = kept != kNone || resultOutput == kNone;
    if (!isKept || dup2(STDERR_FILENO, STDOUT_FILENO) < 0) return;
    resultOutput = kept;
}

bool writeStandardOutput(std::string_view bytes) {
    while (!bytes.empty()) {
        ssize_t const written = ::write(resultOutput, bytes.data(), bytes.size());
        if (written < 0 && errno != EINTR) return false;
        if (written > 0) bytes.remove_prefix(static_cast<std::size_t>(written));
    }
    return true;
}

}  // namespace tzhost
