#include "host/editors/program.h"

#include <cerrno>
#include <csignal>
#include <cstring>
#include <fcntl.h>
#include <sys/wait.h>
#include <termios.h>
#include <unistd.h>

#include "host/text/local_text.h"
#include "tz/text/string.h"

namespace tzhost {
namespace {

// The terminal of standard input, given to a program and taken back.
class Terminal {
public:
    Terminal() : isTerminal_(isatty(STDIN_FILENO) == 1) {
        if (!isTerminal_) return;
        tcgetattr(STDIN_FILENO, &settings_);
        // The host is in the background while the program runs and must not be stopped for that.
        struct sigaction ignore {};
        ignore.sa_handler = SIG_IGN;
        sigaction(SIGTTOU, &ignore, &before_);
    }
    Terminal(Terminal const&) = delete;
    Terminal& operator=(Terminal const&) = delete;
    ~Terminal() {
        if (!isTerminal_) return;
        tcsetpgrp(STDIN_FILENO, getpgrp());
        tcsetattr(STDIN_FILENO, TCSADRAIN, &settings_);
        sigaction(SIGTTOU, &before_, nullptr);
        // Wherever the program left the cursor, what follows begins a line.
        if (isatty(STDOUT_FILENO) == 1) (void)!write(STDOUT_FILENO, "\r", 1);
    }
    [[nodiscard]] bool isTerminal() const { return isTerminal_; }
    void giveTo(pid_t program) const {
        if (isTerminal_) tcsetpgrp(STDIN_FILENO, program);
    }

private:
    bool isTerminal_;
    termios settings_{};
    struct sigaction before_ {};
};

// The words as execvp takes them; they must outlive that.
std::vector<char*> argumentsOf(std::vector<std::string>& words) {
    std::vector<char*> arguments;
    for (std::string& word : words)
        arguments.push_back(word.data());
    arguments.push_back(nullptr);
    return arguments;
}

// In the child: becomes the program, or tells through the pipe why it cannot. Nothing here may
// throw, else the child would go on as a second host.
[[noreturn]] void
become(std::vector<char*> const& arguments, Terminal const& terminal, int report) noexcept {
    setpgid(0, 0);
    terminal.giveTo(getpid());
    for (int const each : {SIGINT, SIGQUIT, SIGTSTP, SIGTTIN, SIGTTOU, SIGPIPE, SIGXFSZ})
        std::signal(each, SIG_DFL);
    execvp(arguments[0], arguments.data());
    int const reason = errno;
    (void)!write(report, &reason, sizeof reason);
    _exit(127);
}

// A program that stops itself goes on at once: its session waits for it, and so does the terminal.
int waitFor(pid_t child) {
    int status = 0;
    for (;;) {
        pid_t const changed = waitpid(child, &status, WUNTRACED);
        if (changed < 0 && errno != EINTR) return status;
        if (changed < 0) continue;
        if (!WIFSTOPPED(status)) return status;
        kill(-child, SIGCONT);
    }
}

std::string notRun(int reason) {
    return localText("cannot be run") + ": " + localText(std::strerror(reason));
}

std::string problemOf(int status) {
    TzString const problem =
        WIFSIGNALED(status)
            ? TzString::formatted(localText(L"was killed by signal %d"), WTERMSIG(status))
            : TzString::formatted(localText(L"ended with exit status %d"), WEXITSTATUS(status));
    return problem.toUtf8();
}

}  // namespace

std::vector<std::string> splitCommand(std::string_view command) {
    std::vector<std::string> words;
    bool open = false;  // a word has begun
    char quote = 0;
    for (char const c : command) {
        if (quote ? c == quote : c == '"' || c == '\'') {
            quote = quote ? '\0' : c;
            if (!open) words.emplace_back();
            open = true;
        } else if (!quote && (c == ' ' || c == '\t')) {
            open = false;
        } else {
            if (!open) words.emplace_back();
            open = true;
            words.back() += c;
        }
    }
    return words;
}

ProgramResult runProgram(std::string_view command, std::filesystem::path const& file) {
    std::vector<std::string> words = splitCommand(command);
    if (words.empty()) return {false, localText("is no command")};
    words.push_back(file.string());
    std::vector<char*> const arguments = argumentsOf(words);
    int report[2];
    if (pipe2(report, O_CLOEXEC) != 0) return {false, notRun(errno)};
    Terminal const terminal;
    pid_t const child = fork();
    if (child == 0) become(arguments, terminal, report[1]);
    close(report[1]);
    if (child < 0) {
        int const reason = errno;
        close(report[0]);
        return {false, notRun(reason)};
    }
    setpgid(child, child);
    terminal.giveTo(child);
    int reason = 0;
    bool const missing = read(report[0], &reason, sizeof reason) == sizeof reason;
    close(report[0]);
    int const status = waitFor(child);
    if (missing) return {false, notRun(reason)};
    if (WIFEXITED(status) && WEXITSTATUS(status) == 0) return {true, ""};
    return {false, problemOf(status)};
}

}  // namespace tzhost
