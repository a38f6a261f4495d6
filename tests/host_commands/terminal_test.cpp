#include <gtest/gtest.h>

#include <chrono>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <poll.h>
#include <pty.h>
#include <sstream>
#include <sys/wait.h>
#include <termios.h>
#include <unistd.h>

namespace {

namespace fs = std::filesystem;

constexpr int kPatienceMilliseconds = 20000;

// The program at a terminal of its own.
class Terminal {
public:
    // The arguments of the program are apart by blanks.
    explicit Terminal(std::string const& editor, std::string const& arguments = "") {
        fs::remove_all(desk());
        fs::create_directories(desk());
        for (char const* const name : {"there.json", "locked.json", "locked.svg", "plot.svg"})
            std::ofstream(desk() / name) << "{}";
        for (char const* const name : {"locked.json", "locked.svg"})
            fs::permissions(desk() / name, fs::perms::owner_read);
        winsize const size{40, 200, 0, 0};
        child_ = forkpty(&screen_, nullptr, nullptr, &size);
        if (child_ != 0) return;
        setenv("TERM", "xterm", 1);
        setenv("LC_ALL", "C.UTF-8", 1);
        setenv("XDG_CONFIG_HOME", configuration().c_str(), 1);
        setenv("HOME", desk().c_str(), 1);
        unsetenv("VISUAL");
        setenv("EDITOR", editor.c_str(), 1);
        fs::current_path(desk());
        std::string const program = std::string(std::getenv("TZ_TEST_BIN")) + "/tzdraft";
        execl("/bin/sh", "sh", "-c", ("exec " + program + " " + arguments).c_str(), nullptr);
        _exit(127);
    }
    Terminal(Terminal const&) = delete;
    Terminal& operator=(Terminal const&) = delete;
    ~Terminal() {
        if (child_ > 0) kill(child_, SIGKILL);
        close(screen_);
    }

    // The program's working folder. "there.json" and "plot.svg" are there, and "locked.json" and
    // "locked.svg", which are read-only.
    static fs::path desk() { return fs::path(testing::TempDir()) / "desk"; }
    static fs::path configuration() { return fs::path(testing::TempDir()) / "configuration"; }

    // Waits until the program edits a line; before that the terminal itself would take some keys.
    void type(std::string_view keys) {
        termios settings{};
        for (int waited = 0; waited < kPatienceMilliseconds; waited += 5) {
            if (tcgetattr(screen_, &settings) == 0 && (settings.c_lflag & ISIG) == 0) break;
            usleep(5000);
        }
        EXPECT_EQ(write(screen_, keys.data(), keys.size()), static_cast<ssize_t>(keys.size()));
    }

    // Reads on until the text has shown; what comes after it is left for the next call.
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

    void signal(int number) const { kill(child_, number); }

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
    {"EnterRepeats", {kIdle, "U\r", kIdle, "\r"}, "take back.", 0, kNone},
    {"EnterRepeatsNoSlip", {kIdle, "U\r", kIdle, "UU\r", kIdle, "\r"}, "\r\nCommand: ", 0, kNone},
    {"SaysWhereOneIs",
     {"tzdraft 1.0, a drawing without a name. HELP lists the commands.", ""},
     kIdle,
     0,
     kNone},
    {"PointsTellTheirDistance",
     {kIdle, "CIRCLE\r", kCenter, "1,1\r", "Radius", "4,5\r", "4,5\r\n5.0000\r\n", "U\r"},
     "CIRCLE",
     0,
     kNone},
    {"ControlCCancels", {kIdle, "CIRCLE\r", kCenter, "1,2\x03"}, "^C\r\nCommand: ", 0, kNone},
    // The next answer used to lose its first character.
    {"EscapeCancels", {kIdle, "CIRCLE\r", kCenter, "1,2\x1b"}, "^C\r\nCommand: ", 0, kNone},
    {"ArrowsRecall", {kIdle, "CIRCLE\r", kCenter, "\x03", kIdle, "\x1b[A\r"}, kCenter, 0, kNone},
    // They used to leave "~", "5~" and "5D" in the line.
    {"KeysOfNoUse", {kIdle, "CLE\x1b[5~\x1b[15;5~\x1b[1;5DCIR\r"}, kCenter, 0, kNone},
    {"BlanksAroundACommand", {kIdle, " CIRCLE \r"}, kCenter, 0, kNone},
    {"BeginningsOfCommands", {kIdle, "mt\r"}, "Near it is MTEXT.", 0, kNone},
    {"AnswersAfterACommand", {kIdle, "circle 0,0\r"}, "Near it is CIRCLE.", 0, kNone},
    {"PointsInADrag", {kIdle, "MTEXT\r", kFirst, "0;0\r"}, "@x,y or @length<angle", 0, kNone},
    {"HandlesThatAreNone", {kIdle, "MTEDIT\r", "text: ", "#99\r"}, "no entity #99", 0, kNone},
    {"WordsAreOffered",
     {kIdle, "UCS\r", "<World>: ", "Q\r"},
     "One of the words in question will do, too.",
     0,
     kNone},
    {"ControlCAtTheIdlePrompt", {kIdle, "abc\x03"}, "^C\r\nCommand: ", 0, kNone},
    // The mark used to stand on the letters after the cursor.
    {"ControlCWithinALine", {kIdle, "abc\x01\x03"}, "abc^C\r\nCommand: ", 0, kNone},
    {"ControlDInsideACommand", {kIdle, "CIRCLE\r", kCenter, "\x04"}, "\r\n", 1, kNone},
    {"TabCompletesACommand", {kIdle, "circ\t\r"}, kCenter, 0, kNone},
    {"TabShowsChoices", {kIdle, "LI\t"}, "LINE  LIST", 0, kNone},
    {"DragGoesOn", {kIdle, "MTEXT\r", kFirst, "0,0\r", kOther, "~3,-3\r"}, kOther, 0, kNone},
    {"EditorFails",
     {kIdle, "MTEXT\r", kFirst, "0,0\r", kOther, "9,-9\r"},
     "exit status 1",
     0,
     kNone},
    {"EditorKilled",
     {kIdle, "MTEXT\r", kFirst, "0,0\r", kOther, "9,-9\r"},
     "killed by signal 9",
     0,
     kKilled},
    {"EditorStops",
     {kIdle, "MTEXT\r", kFirst, "0,0\r", kOther, "9,-9\r"},
     "exit status 3",
     0,
     kStopped},
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

struct CareCase {
    char const* name;
    char const* dialogue;  // what shows, a bar, what is typed then, a bar, and so on
    char const* last;      // shows in the end
};

constexpr char kEnds[] = "QUIT\r\n";  // and nothing is asked
constexpr char kQuit[] = "Quit without saving them? [Yes/No] <No>: ";
constexpr char kReplace[] = "Replace it? [Yes/No] <No>: ";
constexpr char kUnnamed[] = "not saved: a drawing without a name.";
constexpr char kCircle[] = "Command: |CIRCLE\r|point: |1,2\r|Radius: |3\r|: ";

// The program used to ask, say and complete nothing of this. "*" draws a circle, and "$" begins the
// program's arguments.
constexpr CareCase kCare[] = {
    {"QuitStays", "*|QUIT\r|<No>: |\r", kIdle},
    {"ControlDStays", "*|\x04|<No>: |\x03", kIdle},
    {"LeavesACommand", "*|TEXT\r|: |\x04|<No>: |n\r|: |QUIT\r", kQuit},
    {"QuitKnowsWhatUHas", "*|NEW\r|: |QUIT\r", kUnnamed},
    {"SavedIsSaved", "*|SAVE\r|: |a.json\r|Saved: /|QUIT\r", kEnds},
    {"TakenBackIsSaved", "*|U\r|: |QUIT\r", kEnds},
    {"SavedAtTheEnd", "$--save b.json|*|QUIT\r", kEnds},
    {"APickIsNoChange", ": |CIRCLE\r|: |1,1\r|: |\x03|: |QUIT\r", kEnds},
    {"NewPushesOneOut",
     "*|NEW\r|: |NEW\r|: |NEW\r|: |NEW\r|: |NEW\r|: |NEW\r|: |NEW\r|: |NEW\r|: |NEW\r", "<No>"},
    // A name or value that is none is asked for again: it used to end the command.
    {"LayersAgain",
     ": |LAYER\r|: |M\r|rent: |a/b\r|ends.\r\nName of| W \r|: |C\r|<7>: |red\r|colour.\r\nColour|"
     "0\r|colour.\r\nColour|3\r"
     "|<W>: |x\r|\"x\".\r\nLayer to colour|W\r|: |OFf\r|<W>: |?\r|layer: \"W\".\r\nLayer to|\r|"
     "does not show.|D\r|delete: |0\r",
     "stays.\r\nLayer to delete: "},
    {"VariablesAgain",
     ": |SETVAR\r|: |LUNIT\r|them.\r\nVariable|LUNITS\r|<2>: |9\r|to 5.\r\nNew|4\r|: |SETVAR\r"
     "|: |LUNITS\r",
     "<4>: "},
    {"StylesAgain",
     ": |STYLE\r|: |a/b\r|ends.\r\nText|S\r|: |\r|height|-1\r|negative.\r\nText|3\r|: |0\r",
     "zero.\r\nWidth"},
    {"SlantsAgain",
     ": |STYLE\r|: |\r|: |\r|: |\r|: |\r|angle <0.0000>: |90\r|degrees.\r\nObl|350\r", "Backward"},
    {"BlocksAgain",
     "*|ATTDEF\r|: |\r|tag: |T W\r|blanks.\r\nAttribute|\x03|: |BLOCK\r|: |a/b\r|ends.\r\nName|B\r"
     "|point: |1,2\r|: |all\r|: |\r|: |BLOCK\r|: |b\r|already.\r\nName|\x03|: |INSERT\r|: |c\r",
     "\"c\".\r\nBlock to insert"},
    {"AxesAgain", ": |UCS\r|: |3P\r|: |0,0\r|axis: |0,0\r|itself.\r\nPoint|1,0\r|Y axis: |2,0\r",
     "line.\r\nPoint"},
    {"HelpFitsTheScreen", "$$(stty cols 60)|Command: |HELP\r|list: |\r",
     "Copies what is selected from a base point\r\n                 to others; Enter ends.\r\n"},
    {"TopicsFitTheScreen", "$$(stty cols 60)|Command: |HELP\r|list: |PLOT\r",
     "has one;\r\nthe file"},
    {"TopicsAreBrokenAnew", "$$(stty cols 90)|Command: |HELP\r|list: |TEXTALIGN\r",
     "at the\r\nsecond point, sets"},
    {"ChoicesFitTheScreen", "$$(stty cols 60)|Command: |\t", "EXIT  \r\nHELP"},
    {"HelpAgain", ": |HELP\r|: |LINI\r|LINE.\r\nCommand, or|?\r", "UNLOAD  "},
    {"FilesAgain",
     ": |SAVE\r|: |/none/a\r|directory\r\nSave|d.json\r|: |OPEN\r|: |none\r|ory\r\nDrawing|\r|: |"
     "PLOT\r"
     "|: |a.gif\r",
     ".pdf\r\nFile"},
    {"SaveAsksFirst", ": |SAVE\r|: |there.json\r|<No>: |\r", kIdle},
    {"SaveAsksOnce", ": |SAVE\r|: |there.json\r|<No>: |y\r|Saved: /|SAVE\r|n>: |\r", "Saved: /"},
    {"SaveAsksReadOnly",
     ": |SAVE\r|: |locked.json\r|read-only: |y\r|Saved: /|SAVE\r|n>: |\r|read-only: |y\r",
     "Saved: /"},
    {"OpenSaysWhat", ": |SAVE\r|: |c.json\r|Saved: |OPEN\r|open: |c.json\r", "Opened: /"},
    {"PlotSaysWhat", ": |PLOT\r|: |a.svg\r", "/desk/a.svg.\r\na.svg: nothing is drawn there\r\n"},
    // PLOT used to replace the first without a word, and could not replace the second.
    {"PlotAsksOnce",
     ": |PLOT\r|to: |plot.svg\r|<No>: |y\r|Plotted: /|PLOT\r|to: |plot.svg\r|Plotted: /|PLOT\r|"
     ": |there.json\r|<No>: |\r",
     kIdle},
    {"PlotAsksReadOnly",
     ": |PLOT\r|to: |locked.svg\r|read-only: |y\r|Plotted: /|PLOT\r|to: |locked.svg\r|read-only: |",
     "<No>: "},
    {"TabInAText", ": |TEXT\r|: |0,0\r|: |1\r|: |\r|: |a\tb\r|: |LIST\r|: |l\r|: |\r", "  a\tb"},
    {"FilesComplete", ": |SAVE\r|: |th\t\r", kReplace},
    // "~" used to be a folder of that name.
    {"FilesAtHome", ": |SAVE\r|: |~/h.json\r|/desk/h.json.|OPEN\r|: |~/th\t", "ere.json"},
    {"ModulesComplete", ": |LOAD\r|: |sheetm\t", "arks.tzx"},
    // Enter keeps a value; what is no value is asked for again.
    {"PropertiesAreAskedFor",
     "$--var MTEXTED=OLDEDITOR|: |-MTEXT\r|: |0,0\r|: |9,-9\r|: |one\r|: |\r|: |MTPROP\r|: |#1\r|"
     "textHeight, a number above 0 <0.2>: |0\r|"
     "no value for textHeight, expected a number above 0.|3\r|bottom right <1>: |5\r|"
     "or more <9>: |\r|"
     "in radians <0>: |\r|text style <Standard>: |\r|: |\r|: |\r|: |\r|: |\r|: |MTPROP\r|: |#1\r|"
     "above 0 <3>: |\r",
     "bottom right <5>: "},
    {"PropertiesInGerman",
     "$--locale de --var MTEXTED=OLDEDITOR|: |_-MTEXT\r|: |0,0\r|: |9,-9\r|: |one\r|: |\r|"
     ": |_MTPROP\r|: |#1\r|<0.2>: |0\r|Wert für Texthöhe, |\r|",
     "unten rechts <1>: "},
    {"SelectionsAreCounted",
     "*|SELECT\r|objects: |l\r|1 found\r\n|all\r|1 found (1 duplicate), 1 total|r\r|objects: |l\r|"
     "1 removed, 0 total|#1 #99\r|There is no entity #99 here.\r\n|what\r",
     "nothing here. Type a point, #HANDLE, window, crossing, fence, all, last, "},
    {"PointsTellTheirAngle", "*|ROTATE\r|objects: |l\r|: |\r|point: |1,2\r|angle|1,0\r",
     "1,0\r\n270\r\n"},
    // A module that is not there used to end the command.
    {"ModulesAreTold", ": |UNLOAD\r|Unloaded: /|LOAD\r|tzmted.tzx>: |none\r|directory\r\nModule|\r",
     "Loaded: /"},
    // The questions used to show nowhere.
    {"TranscriptInAFile", "$>seen.txt|Command: |CIRCLE\r", "Center point: "},
    // Below a question of two lines the choices used to be cleared again.
    {"ChoicesOfALongQuestion", "$$(printf %0210d 1).json|Command: |SAVE\r|json>: |\t",
     "there.json  \r\nSave drawing as <000"},
    {"StylesComplete", ": |STYLE\r|: |sta\t", "ndard"},
    {"VariablesComplete", ": |SETVAR\r|: |textsi\t\r", "for textsize"},
    {"CommandsComplete", ": |HELP\r|list: |qui\t\r", "Ends the session."},
    {"BeginsUnderAName", "$plan.json|plan.json.|SAVE\r", "as <plan.json>: "},
};

class Care : public testing::TestWithParam<CareCase> {};

TEST_P(Care, IsTaken) {
    fs::remove_all(Terminal::configuration());
    std::string dialogue = GetParam().dialogue;
    std::string arguments;
    if (dialogue.starts_with('$')) {
        arguments = dialogue.substr(1, dialogue.find('|') - 1);
        dialogue.erase(0, arguments.size() + 2);
    }
    if (dialogue.starts_with('*')) dialogue.replace(0, 1, kCircle);
    Terminal terminal(kNone, arguments);
    std::istringstream turns(dialogue);
    for (std::string shown, typed; std::getline(turns, shown, '|');) {
        ASSERT_TRUE(terminal.shows(shown)) << shown << terminal.rest();
        std::getline(turns, typed, '|');
        terminal.type(typed);
    }
    ASSERT_TRUE(terminal.shows(GetParam().last)) << terminal.rest();
    if (GetParam().last != kEnds) terminal.type("\x03\x04yes\r");  // leaves, whatever is asked
    EXPECT_EQ(0, terminal.exitStatus());
}

INSTANTIATE_TEST_SUITE_P(Rows, Care, testing::ValuesIn(kCare), [](auto const& row) {
    return row.param.name;
});

// A signal used to end the program with nothing saved.
TEST(Signals, EndTheSessionInOrder) {
    for (int const number : {SIGTERM, SIGHUP}) {
        Terminal terminal(kNone, "--save kept.json");
        ASSERT_TRUE(terminal.shows(kIdle)) << terminal.rest();
        terminal.type("CIRCLE\r");
        ASSERT_TRUE(terminal.shows(kCenter)) << terminal.rest();
        terminal.signal(number);
        EXPECT_EQ(terminal.exitStatus(), 1);
        EXPECT_TRUE(fs::exists(Terminal::desk() / "kept.json"));
    }
}

// SAVE used to write over what somebody else had made of the file, without a word.
TEST(SaveAgain, AsksAfterSomebodyElseWrote) {
    Terminal terminal(kNone);
    for (char const* const keys : {"SAVE\r", "a.json\r", "SAVE\r"}) {
        ASSERT_TRUE(terminal.shows(": ")) << terminal.rest();
        terminal.type(keys);
    }
    ASSERT_TRUE(terminal.shows("<a.json>: ")) << terminal.rest();
    fs::path const file = Terminal::desk() / "a.json";
    fs::last_write_time(file, fs::last_write_time(file) + std::chrono::hours(1));
    terminal.type("\r");
    ASSERT_TRUE(terminal.shows("written to this file since: a.json.")) << terminal.rest();
    ASSERT_TRUE(terminal.shows(kReplace)) << terminal.rest();
    terminal.type("\rQUIT\r");
    EXPECT_EQ(terminal.exitStatus(), 0);
}

// The session used to end, and the drawing was lost.
TEST(SaveAtTheEnd, AsksWhenItFails) {
    Terminal terminal(kNone, "--save none/kept.json");
    for (char const* const keys : {"CIRCLE\r", "1,2\r", "3\r", "QUIT\r"}) {
        ASSERT_TRUE(terminal.shows(": ")) << terminal.rest();
        terminal.type(keys);
    }
    ASSERT_TRUE(terminal.shows("none/kept.json: cannot be written: ")) << terminal.rest();
    ASSERT_TRUE(terminal.shows(kQuit)) << terminal.rest();
    fs::create_directory(Terminal::desk() / "none");
    terminal.type("\rQUIT\r");
    EXPECT_EQ(terminal.exitStatus(), 0);
    EXPECT_TRUE(fs::exists(Terminal::desk() / "none/kept.json"));
}

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
