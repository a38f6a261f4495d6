#include "apps/tzdraft/terminal_source.h"

#include <clocale>
#include <csignal>
#include <cstdio>
#include <filesystem>
#include <histedit.h>
#include <poll.h>
#include <unistd.h>
#include <utility>

#include "apps/tzdraft/completion.h"
#include "apps/tzdraft/screen_columns.h"
#include "apps/tzdraft/terminal_keys.h"
#include "host/files/install_paths.h"
#include "host/text/utf8.h"
#include "host/text/visible_text.h"

namespace tzdraft {
namespace {

constexpr int kKeptLines = 1000;
constexpr char kHistoryName[] = "history";
constexpr wchar_t kEscape = 0x1B;
constexpr wchar_t kCancel = 3;  // Ctrl-C
// How long the rest of a key may take that the terminal sends as Escape and more.
constexpr int kKeyMilliseconds = 50;

// Empty when the user has no folder for it: then nothing is kept.
std::filesystem::path historyFile() {
    std::filesystem::path const folder = tzhost::configurationFolder();
    return folder.empty() ? folder : folder / kHistoryName;
}

// The editor reads characters as the locale of the environment says, and UTF-8 without one. Numbers
// stay as they are.
void useTerminalCharacters() {
    char const* const chosen = std::setlocale(LC_CTYPE, "");
    if (!chosen || std::string_view(chosen) == "C") std::setlocale(LC_CTYPE, "C.UTF-8");
}

bool moreFollowsAtOnce() {
    pollfd keys{STDIN_FILENO, POLLIN, 0};
    return poll(&keys, 1, kKeyMilliseconds) > 0;
}

// What is written after the key would stand in the middle of the line. So the cursor goes to its
// end first, and the key comes again. Gives how far the cursor went.
int goToEnd(EditLine* line, wchar_t const* key) {
    LineInfoW const* const info = el_wline(line);
    int const way = static_cast<int>(info->lastchar - info->cursor);
    if (way == 0) return 0;
    (void)el_cursor(line, way);
    el_wpush(line, key);
    return way;
}

}  // namespace

// The line editor with its history. Its functions get it back as the editor's client data.
class TerminalSource::Editor {
public:
    Editor();
    Editor(Editor const&) = delete;
    Editor& operator=(Editor const&) = delete;
    ~Editor();

    tzhost::Answer read(tzhost::AnswerRequest const& request);
    [[nodiscard]] bool hasEnded() const { return hasEnded_; }

private:
    static Editor& of(EditLine* line);
    static wchar_t* prompt(EditLine* line) { return of(line).prompt_.data(); }
    static int readKey(EditLine* line, wchar_t* key);
    static unsigned char cancel(EditLine* line, wint_t key);
    static unsigned char suspend(EditLine* line, wint_t key);
    static unsigned char complete(EditLine* line, wint_t key);
    static unsigned char deleteOrLeave(EditLine* line, wint_t key);
    void bindKeys();
    [[nodiscard]] Completion completionOf(std::wstring_view typed) const;
    tzhost::Answer noLine();
    void remember(std::wstring const& text);
    void show(std::vector<std::wstring> const& choices) const;

    // Where the line is edited: prompts are for the person even when the transcript goes elsewhere.
    std::FILE* const screen_ = isatty(STDOUT_FILENO) == 1 ? stdout : stderr;
    EditLine* line_;
    HistoryW* history_;
    struct sigaction interruptBefore_ {};
    tzhost::AnswerRequest const* request_ = nullptr;  // while one is read
    std::wstring prompt_;
    std::vector<std::wstring> choices_;  // of Tab, until the cursor is at the end of the line
    int wayBack_ = 0;                    // from there to where the cursor was
    bool isCancelled_ = false;
    bool isLeft_ = false;    // by Ctrl-D; up to the idle prompt each answer is an end
    bool hasEnded_ = false;  // the terminal is gone
};

TerminalSource::Editor::Editor() {
    useTerminalCharacters();
    struct sigaction ignore {};
    ignore.sa_handler = SIG_IGN;
    sigaction(SIGINT, &ignore, &interruptBefore_);
    history_ = history_winit();
    HistEventW event;
    history_w(history_, &event, H_SETSIZE, kKeptLines);
    history_w(history_, &event, H_SETUNIQUE, 1);
    history_w(history_, &event, H_LOAD, historyFile().c_str());  // none at the first session
    line_ = el_init("tzdraft", stdin, screen_, stderr);
    el_wset(line_, EL_CLIENTDATA, this);
    el_wset(line_, EL_PROMPT, &Editor::prompt);
    el_wset(line_, EL_HIST, history_w, history_);
    el_wset(line_, EL_GETCFN, &Editor::readKey);
    bindKeys();
}

void TerminalSource::Editor::bindKeys() {
    el_wset(line_, EL_EDITOR, L"emacs");
    el_wset(line_, EL_SIGNAL, 1);  // follows the size of the window
    // Ctrl-C and Ctrl-Z come as keys while a line is edited.
    el_wset(line_, EL_SETTY, L"-d", L"-isig", nullptr);
    el_wset(line_, EL_ADDFN, L"tz-cancel", L"cancel the question", &Editor::cancel);
    el_wset(line_, EL_ADDFN, L"tz-complete", L"complete the word", &Editor::complete);
    el_wset(line_, EL_ADDFN, L"tz-suspend", L"suspend the program", &Editor::suspend);
    el_wset(line_, EL_ADDFN, L"tz-leave", L"delete a character, or leave", &Editor::deleteOrLeave);
    el_wset(line_, EL_BIND, L"^C", L"tz-cancel", nullptr);
    el_wset(line_, EL_BIND, L"^Z", L"tz-suspend", nullptr);
    el_wset(line_, EL_BIND, L"^D", L"tz-leave", nullptr);
    el_wset(line_, EL_BIND, L"\t", L"tz-complete", nullptr);
    el_wset(line_, EL_BIND, L"^R", L"em-inc-search-prev", nullptr);
    bindTerminalKeys(line_);
}

TerminalSource::Editor::~Editor() {
    if (auto const file = historyFile(); !file.empty()) {
        std::error_code problem;  // a session without a history is no failure
        std::filesystem::create_directories(file.parent_path(), problem);
        HistEventW event;
        history_w(history_, &event, H_SAVE, file.c_str());
    }
    el_end(line_);
    history_wend(history_);
    sigaction(SIGINT, &interruptBefore_, nullptr);
}

TerminalSource::Editor& TerminalSource::Editor::of(EditLine* line) {
    void* data = nullptr;
    el_wget(line, EL_CLIENTDATA, &data);
    return *static_cast<Editor*>(data);
}

// Escape alone cancels like Ctrl-C. To the line editor it would be the first half of a key, so that
// the answer typed next would lose its first character.
int TerminalSource::Editor::readKey(EditLine* line, wchar_t* key) {
    el_wset(line, EL_GETCFN, EL_BUILTIN_GETCFN);
    int const count = el_wgetc(line, key);
    el_wset(line, EL_GETCFN, &Editor::readKey);
    if (count == 1 && *key == kEscape && !moreFollowsAtOnce()) *key = kCancel;
    return count;
}

unsigned char TerminalSource::Editor::cancel(EditLine* line, wint_t /*key*/) {
    if (goToEnd(line, L"\x03") != 0) return CC_CURSOR;
    of(line).isCancelled_ = true;
    return CC_EOF;
}

// The line editor's handling of the signal gives the terminal back and takes it again; the line is
// shown anew.
unsigned char TerminalSource::Editor::suspend(EditLine* /*line*/, wint_t /*key*/) {
    (void)std::raise(SIGTSTP);  // an unknown signal alone is refused
    return CC_REDISPLAY;
}

unsigned char TerminalSource::Editor::deleteOrLeave(EditLine* line, wint_t /*key*/) {
    LineInfoW const* const info = el_wline(line);
    if (info->buffer == info->lastchar) {
        of(line).isLeft_ = true;
        return CC_EOF;
    }
    if (info->cursor == info->lastchar) return CC_REFRESH_BEEP;
    el_cursor(line, 1);
    el_wdeletestr(line, 1);  // the character before the cursor
    return CC_REFRESH;
}

Completion TerminalSource::Editor::completionOf(std::wstring_view typed) const {
    tzhost::Offer const& offer = request_->offer;
    switch (offer.kind) {
    case tzhost::Offer::Kind::files: return completeFile(typed, offer.home);
    case tzhost::Offer::Kind::names: return completeName(typed, offer.choices);
    case tzhost::Offer::Kind::words: return completeWord(typed, offer.choices);
    case tzhost::Offer::Kind::nothing: break;
    }
    return {L"\t", {}};
}

unsigned char TerminalSource::Editor::complete(EditLine* line, wint_t /*key*/) {
    Editor& editor = of(line);
    if (editor.choices_.empty()) {
        LineInfoW const* const info = el_wline(line);
        Completion completion = editor.completionOf(
            {info->buffer, static_cast<std::size_t>(info->cursor - info->buffer)});
        if (!completion.insert.empty()) {
            el_winsertstr(line, completion.insert.c_str());
            return CC_REFRESH;
        }
        if (completion.choices.empty()) return CC_REFRESH_BEEP;
        editor.choices_ = std::move(completion.choices);
        editor.wayBack_ = goToEnd(line, L"\t");
        if (editor.wayBack_ != 0) return CC_CURSOR;
    }
    editor.show(std::exchange(editor.choices_, {}));
    (void)el_cursor(line, -std::exchange(editor.wayBack_, 0));
    // Shown from here on; to redisplay clears the lines above, of a long prompt's choices too.
    el_wset(line, EL_REFRESH);
    return CC_NORM;
}

// Below the line that is edited, which then is shown anew.
void TerminalSource::Editor::show(std::vector<std::wstring> const& choices) const {
    std::size_t const columns = screenColumns(fileno(screen_));
    std::wstring line;
    std::string text = "\n";
    for (std::wstring const& each : choices) {
        std::wstring const word = tzhost::visible(each, tzhost::LineFeeds::shown) + L"  ";
        bool const fits = columns == 0 || line.size() + word.size() <= columns;
        if (!fits && !line.empty()) text += tzhost::toUtf8(std::exchange(line, {})) + "\n";
        line += word;
    }
    text += tzhost::toUtf8(line) + "\n";
    std::fwrite(text.data(), 1, text.size(), screen_);
    std::fflush(screen_);
}

void TerminalSource::Editor::remember(std::wstring const& text) {
    if (text.find_first_not_of(L" \t") == std::wstring::npos) return;
    HistEventW event;
    history_w(history_, &event, H_ENTER, text.c_str());
}

tzhost::Answer TerminalSource::Editor::noLine() {
    std::fputs(isCancelled_ ? "^C\n" : "\n", screen_);
    std::fflush(screen_);
    hasEnded_ = !isCancelled_ && !isLeft_;
    return {isCancelled_ ? tzhost::Answer::Kind::cancel : tzhost::Answer::Kind::end, {}};
}

tzhost::Answer TerminalSource::Editor::read(tzhost::AnswerRequest const& request) {
    using Kind = tzhost::Answer::Kind;
    bool const isIdle = request.kind == tzhost::QuestionKind::command;
    if (hasEnded_ || std::exchange(isLeft_, isLeft_ && !isIdle)) return {};
    request_ = &request;
    prompt_ = request.prompt;
    isCancelled_ = false;
    int length = 0;
    wchar_t const* const typed = el_wgets(line_, &length);
    if (!typed || length <= 0) {
        tzhost::Answer answer = noLine();
        if (isIdle) isLeft_ = false;
        return answer;
    }
    std::wstring text(typed, static_cast<std::size_t>(length));
    while (text.ends_with(L'\n') || text.ends_with(L'\r'))
        text.pop_back();
    if (text.size() > tzhost::kLongestAnswer) return {Kind::tooLong, {}};
    remember(text);
    return {Kind::line, std::move(text)};
}

TerminalSource::TerminalSource() : editor_(std::make_unique<Editor>()) {}

TerminalSource::~TerminalSource() = default;

bool TerminalSource::isThere() {
    return isatty(STDIN_FILENO) == 1;
}

tzhost::Answer TerminalSource::next(tzhost::AnswerRequest const& request) {
    return editor_->read(request);
}

bool TerminalSource::hasEnded() const {
    return editor_->hasEnded();
}

}  // namespace tzdraft
