#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <poll.h>
#include <pty.h>
#include <sys/wait.h>
#include <termios.h>
#include <unistd.h>

namespace {

namespace fs = std::filesystem;

constexpr int kPatienceMilliseconds = 20000;

// The program at a terminal of its own.
class Terminal {
public:
    explicit Terminal(std::string const& editor) {
        winsize const size{40, 200, 0, 0};
        child_ = forkpty(&screen_, nullptr, nullptr, &size);
        if (child_ != 0) return;
        setenv("TERM", "xterm", 1);
        setenv("LC_ALL", "C.UTF-8", 1);
        setenv("XDG_CONFIG_HOME", configuration().c_str(), 1);
        unsetenv("VISUAL");
        setenv("EDITOR", editor.c_str(), 1);
        std::string const program = std::string(std::getenv("TZ_TEST_BIN")) + "/tzdraft";
        execl(program.c_str(), "tzdraft", nullptr);
        _exit(127);
    }
    Terminal(Terminal const&) = delete;
    Terminal& operator=(Terminal const&) = delete;
    ~Terminal() {
        if (child_ > 0) kill(child_, SIGKILL);
        close(screen_);
    }

    static fs::path configuration() { return fs::path(testing::TempDir()) / "configuration"; }

    // Once the program edits a line; before that the terminal itself would take some keys.
    void type(std::string_view keys) {
        termios settings{};
        for (int waited = 0; waited < kPatienceMilliseconds; waited += 5) {
            if (tcgetattr(screen_, &settings) == 0 && (settings.c_lflag & ISIG) == 0) break;
            usleep(5000);
        }
        EXPECT_EQ(write(screen_, keys.data(), keys.size()), static_cast<ssize_t>(keys.size()));
    }

    // Reads on until the text has shown; what stands behind it is left for the next call.
    [[nodiscard]] bool shows(std::string_view text) {
        for (;;) {
            std::size_t const at = seen_.find(text);
            if (at != std::string::npos) {
                seen_.erase(0, at + text.size());
                return true;
            }
            if (!readMore()) return false;
        }
    }

    // A program that does not end is killed.
    [[nodiscard]] int exitStatus() {
        while (readMore()) {
        }
        if (isWaiting_) kill(child_, SIGKILL);
        int status = 0;
        waitpid(child_, &status, 0);
        child_ = -1;
        return WIFEXITED(status) ? WEXITSTATUS(status) : -WTERMSIG(status);
    }

    [[nodiscard]] std::string const& rest() const { return seen_; }

private:
    bool readMore() {
        pollfd ready{screen_, POLLIN, 0};
        isWaiting_ = poll(&ready, 1, kPatienceMilliseconds) <= 0;
        if (isWaiting_) return false;
        char bytes[4096];
        ssize_t const count = read(screen_, bytes, sizeof bytes);
        if (count <= 0) return false;
        seen_.append(bytes, static_cast<std::size_t>(count));
        return true;
    }

    int screen_ = -1;
    pid_t child_ = -1;
    bool isWaiting_ = false;
    std::string seen_;
};

struct KeysCase {
    char const* name;
    std::vector<char const*> dialogue;  // what shows, and what is typed then, by turns
    char const* last;                   // shows in the end
    int status;
    char const* editor;
};

constexpr char kNone[] = "false";
constexpr char kKilled[] = "sh -c 'kill -9 $$'";
constexpr char kStopped[] = "sh -c 'kill -STOP $$; exit 3'";
constexpr char kIdle[] = "Command: ";
constexpr char kFirst[] = "first corner: ";
constexpr char kOther[] = "opposite corner";
constexpr char kCenter[] = "Center point: ";

KeysCase const kCases[] = {
    {"EnterRepeats",            {kIdle, "U\r", kIdle, "\r"},                            "take back.",      0, kNone},
    {"ControlCCancels",         {kIdle, "CIRCLE\r", kCenter, "1,2\x03"},                "^C\r\nCommand: ", 0, kNone},
    {"ControlCAtTheIdlePrompt", {kIdle, "abc\x03"},                                     "^C\r\nCommand: ", 0, kNone},
    {"ControlDInsideACommand",  {kIdle, "CIRCLE\r", kCenter, "\x04"},                   "\r\n",            1, kNone},
    {"TabCompletesACommand",    {kIdle, "circ\t\r"},                                    kCenter,           0, kNone},
    {"TabShowsChoices",         {kIdle, "LI\t"},                                        "LINE  LIST",      0, kNone},
    {"DragGoesOn",              {kIdle, "MTEXT\r", kFirst, "0,0\r", kOther, "~3,-3\r"}, kOther,            0, kNone},
    {"EditorFails",
     {kIdle, "MTEXT\r", kFirst, "0,0\r", kOther, "9,-9\r"},
     "exit status 1",                                                                                      0,
     kNone                                                                                                         },
    {"EditorKilled",
     {kIdle, "MTEXT\r", kFirst, "0,0\r", kOther, "9,-9\r"},
     "killed by signal 9",                                                                                 0,
     kKilled                                                                                                       },
    {"EditorStops",
     {kIdle, "MTEXT\r", kFirst, "0,0\r", kOther, "9,-9\r"},
     "exit status 3",                                                                                      0,
     kStopped                                                                                                      },
};

class Keys : public testing::TestWithParam<KeysCase> {};

// At the end Ctrl-C leaves the question that stands, and Ctrl-D the program.
TEST_P(Keys, Show) {
    fs::remove_all(Terminal::configuration());
    Terminal terminal(GetParam().editor);
    std::vector<char const*> const& dialogue = GetParam().dialogue;
    for (std::size_t at = 0; at < dialogue.size(); at += 2) {
        ASSERT_TRUE(terminal.shows(dialogue[at])) << terminal.rest();
        terminal.type(dialogue[at + 1]);
    }
    ASSERT_TRUE(terminal.shows(GetParam().last)) << terminal.rest();
    if (GetParam().status == 0) terminal.type("\x03\x04");  // else it has ended by itself
    EXPECT_EQ(GetParam().status, terminal.exitStatus());
}

INSTANTIATE_TEST_SUITE_P(Typed, Keys, testing::ValuesIn(kCases), [](auto const& row) {
    return row.param.name;
});

TEST(History, IsThereInTheNextSession) {
    fs::remove_all(Terminal::configuration());
    {
        Terminal first("true");
        for (char const* const keys : {"HELP\r", "U\r", "QUIT\r"}) {
            ASSERT_TRUE(first.shows(": ")) << first.rest();
            first.type(keys);
        }
        EXPECT_EQ(0, first.exitStatus());
    }
    Terminal next("true");
    ASSERT_TRUE(next.shows("Command: ")) << next.rest();
    next.type("\x10\x10\x10\r");  // three lines up
    EXPECT_TRUE(next.shows("Command, or Enter for the list: ")) << next.rest();
}

}  // namespace
