#include "host/editors/program.h"

#include <cerrno>
#include <csignal>
#include <fcntl.h>
#include <sys/wait.h>
#include <unistd.h>

#include "host/editors/lent_terminal.h"
#include "host/editors/passed_signals.h"
#include "host/text/local_text.h"
#include "host/text/system_words.h"
#include "tz/text/string.h"

namespace tzhost {
namespace {

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
[[noreturn]] void become(std::vector<char*> const& arguments,
                         LentTerminal const& terminal,
                         PassedSignals const& passed,
                         int report) noexcept {
    setpgid(0, 0);
    terminal.giveTo(getpid());
    terminal.becomeInput();
    for (int const each : {SIGINT, SIGQUIT, SIGTSTP, SIGTTIN, SIGTTOU, SIGPIPE, SIGXFSZ})
        std::signal(each, SIG_DFL);
    passed.forget();
    execvp(arguments[0], arguments.data());
    int const reason = errno;
    (void)!write(report, &reason, sizeof reason);
    _exit(127);
}

// A program that stops itself goes on at once: its session waits for it, and so does the terminal.
// One that wants a terminal which cannot be lent would stop again and again, so it is ended.
int waitFor(pid_t child, LentTerminal const& terminal) {
    int status = 0;
    for (;;) {
        pid_t const changed = waitpid(child, &status, WUNTRACED);
        if (changed < 0 && errno != EINTR) return status;
        if (changed < 0) continue;
        if (!WIFSTOPPED(status)) return status;
        bool const wantsTerminal = WSTOPSIG(status) == SIGTTIN || WSTOPSIG(status) == SIGTTOU;
        kill(-child, wantsTerminal && !terminal.isThere() ? SIGKILL : SIGCONT);
    }
}

// Gives the program the terminal and waits for its end; its status. `reason` is set when the
// program could not be run, which comes over the pipe `report`.
int follow(pid_t child, LentTerminal const& terminal, int report, int& reason) {
    terminal.giveTo(child);
    ssize_t got = 0;
    do {
        got = read(report, &reason, sizeof reason);
    } while (got < 0 && errno == EINTR);
    return waitFor(child, terminal);
}

std::string notRun(int reason) {
    return localText("cannot be run") + ": " + systemWords(reason);
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
    PassedSignals passed;  // goes last: what it postponed may end the process
    LentTerminal const terminal;
    pid_t const child = fork();
    if (child == 0) become(arguments, terminal, passed, report[1]);
    int reason = child < 0 ? errno : 0;
    close(report[1]);
    if (child > 0) {
        setpgid(child, child);
        passed.passTo(child);
    }
    int const status = child < 0 ? 0 : follow(child, terminal, report[0], reason);
    close(report[0]);
    if (reason != 0) return {false, notRun(reason)};
    if (WIFEXITED(status) && WEXITSTATUS(status) == 0) return {true, ""};
    return {false, problemOf(status)};
}

}  // namespace tzhost
