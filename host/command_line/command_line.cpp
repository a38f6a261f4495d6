#include "host/command_line/command_line.h"

#include <algorithm>
#include <utility>

#include "host/base/event_sink.h"
#include "host/command_line/jig_driver.h"
#include "host/runtime/documents.h"
#include "host/text/local_text.h"
#include "host/text/utf8.h"
#include "host/text/visible_text.h"
#include "tz/rx/status.h"

namespace tzhost {

namespace {

constexpr int kMostFailures = 100;
constexpr wchar_t const* kIdlePrompt = forLocalText(L"Command: ");
constexpr std::wstring_view kCancelEcho = L"^C";

std::wstring_view withoutLineEnds(std::wstring_view text) {
    text.remove_prefix(std::min(text.size(), text.find_first_not_of(L'\n')));
    return text.substr(0, text.find_last_not_of(L'\n') + 1);
}

}  // namespace

CommandLine& commandLine() {
    static CommandLine theLine;
    return theLine;
}

CommandLine::~CommandLine() {
    if (!isAttached_) return;
    setPrintSink(nullptr);
    setNotificationSink(nullptr);
}

void CommandLine::attach() {
    setPrintSink(this);
    setNotificationSink(this);
    isAttached_ = true;
}

AnswerSource* CommandLine::setSource(AnswerSource* source) {
    return std::exchange(source_, source);
}

void CommandLine::reset() {
    source_ = nullptr;
    transcript_ = {};
    mustEnd_ = {};
    sent_.clear();
    armed_ = {};
    offer_ = {};
    input_.reset();
    voice_ = Voice::module;
    failures_ = 0;
    hasFailed_ = false;
    hasEndedInCommand_ = false;
    endsAtProblems_ = false;
    isStopped_ = false;
    resetDragCursor();
}

void CommandLine::print(std::wstring_view text) {
    if (text.empty()) return;
    if (voice_ != Voice::host) {
        reportEvent([&] { return Event{{"event", "print"}, {"text", toUtf8(text)}}; });
    }
    std::wstring_view const words = withoutLineEnds(text);
    if (voice_ != Voice::function || words.empty()) return transcript_.message(text);
    transcript_.message(text, Shown::problem);
    countProblem(words);
}

// It has lines of its own; a line end that its text begins with adds no empty one.
void CommandLine::notify(Notification const& notification) {
    std::wstring_view const text = notification.text;
    transcript_.problem(text.substr(text.starts_with(L'\n') ? 1 : 0));
}

void CommandLine::complain(std::wstring const& text) {
    hasFailed_ = true;
    isStopped_ = endsAtProblems_ && !isPerson();
    transcript_.error(text);
}

// The first thing that goes wrong ends the script; what follows from it is not told as an error.
void CommandLine::countProblem(std::wstring_view what) {
    if (endsAtProblems_ && !isPerson() && !isStopped_) complain(place() + std::wstring(what));
}

void CommandLine::sayProblem(std::wstring_view what) {
    transcript_.problem(what);
    countProblem(what);
}

std::wstring CommandLine::place() const {
    return source_ ? source_->place() : L"";
}

void CommandLine::sayFailure(std::wstring const& what) {
    transcript_.problem(visible(what, LineFeeds::shown));
    if (!isPerson()) complain(place() + what);
}

// Said once, however many questions still wait.
void CommandLine::endedInCommand(std::wstring const& where) {
    if (std::exchange(hasEndedInCommand_, true) || where.empty()) return;
    transcript_.error(where + localText(L"the input ends inside a command"));
}

bool CommandLine::hasEnded() const {
    return isStopped_ || source_ == nullptr || source_->hasEnded() || (mustEnd_ && mustEnd_());
}

bool CommandLine::mustEnd() {
    bool const isOver = mustEnd_ && mustEnd_();
    hasFailed_ = hasFailed_ || isOver;
    return isOver || isStopped_;
}

Answer CommandLine::readFromSource(AnswerRequest const& request) {
    while (source_ != nullptr && !isStopped_) {
        Answer answer = source_->next(request);
        if (answer.kind != Answer::Kind::fault) return answer;
        complain(answer.text);
    }
    return {};
}

// What was read when the input had to end is a part of an answer at most.
Answer CommandLine::read(AnswerRequest const& request) {
    if (mustEnd()) return {};
    Answer answer = sent_.isEmpty() ? readFromSource(request) : sent_.next();
    return mustEnd() ? Answer() : answer;
}

// Who owns the terminal edits one line: what stands above it is shown from here.
void CommandLine::showPrompt(AnswerRequest& request, std::wstring const& prompt) {
    request.prompt = prompt;
    bool const isOwned = sent_.isEmpty() && source_ != nullptr && source_->ownsTerminal();
    std::size_t const above = isOwned ? prompt.rfind(L'\n') + 1 : prompt.size();
    transcript_.prompt(request.prompt.substr(0, above));
    if (isOwned) request.prompt.remove_prefix(above);
}

void CommandLine::showAnswer(Answer const& answer) {
    if (answer.kind == Answer::Kind::line || answer.kind == Answer::Kind::cancel)
        transcript_.answer(answer.kind == Answer::Kind::line ? answer.text : kCancelEcho);
}

Answer CommandLine::ask(AnswerRequest request) {
    bool const isTyped = sent_.isEmpty() && source_ != nullptr && source_->echoes();
    std::wstring const prompt = visible(request.prompt);
    showPrompt(request, prompt);
    Answer const answer = read(request);
    if (answer.kind != Answer::Kind::end) failures_ = 0;
    if (isTyped) {
        transcript_.answerWasTyped();
    } else {
        showAnswer(answer);
    }
    if (answer.kind == Answer::Kind::end && request.kind != QuestionKind::command)
        endedInCommand(answer.text);
    return answer;
}

std::optional<std::wstring> CommandLine::readCommand(std::vector<std::wstring> words) {
    if (Document* const document = documents().current()) {
        for (TzString const& text : document->typed)
            sent_.push(text.str());
        document->typed.clear();
    }
    AnswerRequest const request{
        QuestionKind::command, localText(kIdlePrompt), {Offer::Kind::words, std::move(words)}};
    while (true) {
        Answer answer = ask(request);
        if (answer.kind == Answer::Kind::line) return std::move(answer.text);
        if (answer.kind == Answer::Kind::end) return std::nullopt;
        if (answer.kind == Answer::Kind::tooLong) sayProblem(localText(L"That line is too long."));
    }
}

std::optional<EditorBlock> CommandLine::takeEditorBlock() {
    if (isStopped_) return EditorBlock{L"", false};
    return source_ == nullptr ? std::nullopt : source_->takeBlock();
}

Armed CommandLine::takeArmed() {
    input_.reset();
    return std::exchange(armed_, {});
}

std::optional<std::wstring> CommandLine::takeInput() {
    return std::exchange(input_, std::nullopt);
}

int CommandLine::failed(int status) {
    if (++failures_ < kMostFailures) return status;
    failures_ = 0;
    return Tzad::ePromptCancel;
}

int CommandLine::answered(std::wstring_view line, int status) const {
    reportEvent([&] {
        return Event{{"event", "answer"}, {"line", toUtf8(line)}, {"status", status}};
    });
    return status;
}

}  // namespace tzhost
