#include "host/command_line/command_line.h"

#include <utility>

#include "host/base/event_sink.h"
#include "host/command_line/jig_driver.h"
#include "host/runtime/documents.h"
#include "host/text/local_text.h"
#include "host/text/utf8.h"
#include "tz/rx/status.h"

namespace tzhost {

namespace {

constexpr int kMostFailures = 100;
constexpr wchar_t const* kIdlePrompt = forLocalText(L"Command: ");
constexpr std::wstring_view kCancelEcho = L"^C";

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
    errors_ = {};
    sent_.clear();
    armed_ = {};
    input_.reset();
    voice_ = Voice::module;
    failures_ = 0;
    hasFailed_ = false;
    resetDragCursor();
}

void CommandLine::print(std::wstring_view text) {
    if (text.empty()) return;
    if (voice_ == Voice::module) {
        reportEvent([&] {
            return Event{
                {"event", "print"     },
                {"text",  toUtf8(text)}
            };
        });
    }
    transcript_.message(text);
}

// It has lines of its own; a line end that its text begins with adds no empty one.
void CommandLine::notify(Notification const& notification) {
    std::wstring_view const text = notification.text;
    say(text.substr(text.starts_with(L'\n') ? 1 : 0));
}

void CommandLine::complain(std::wstring const& text) {
    hasFailed_ = true;
    if (errors_) errors_(text + L"\n");
}

// Said once, however many questions still wait.
void CommandLine::endedInCommand(std::wstring const& where) {
    if (!hasFailed_ && !where.empty())
        complain(where + localText(L"the input ends inside a command"));
    hasFailed_ = true;
}

Answer CommandLine::readFromSource(AnswerRequest const& request) {
    while (source_ != nullptr) {
        Answer answer = source_->next(request);
        if (answer.kind != Answer::Kind::fault) return answer;
        complain(answer.text);
    }
    return {};
}

Answer CommandLine::ask(AnswerRequest const& request) {
    bool const isSent = !sent_.isEmpty();
    bool const isOnTerminal = !isSent && !isScripted();
    AnswerRequest shown = request;
    if (isOnTerminal) {
        // The terminal edits one line: what stands above it is shown from here.
        std::size_t const above = request.prompt.rfind(L'\n') + 1;
        shown.prompt.remove_prefix(above);
        transcript_.prompt(request.prompt.substr(0, above));
    } else {
        transcript_.prompt(request.prompt);
    }
    Answer answer = isSent ? sent_.next() : readFromSource(shown);
    if (answer.kind != Answer::Kind::end) failures_ = 0;
    if (isOnTerminal) {
        transcript_.answeredOnTerminal();
    } else if (answer.kind == Answer::Kind::line || answer.kind == Answer::Kind::cancel) {
        transcript_.answer(answer.kind == Answer::Kind::line ? answer.text : kCancelEcho);
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
    AnswerRequest const request{QuestionKind::command, localText(kIdlePrompt), std::move(words)};
    while (true) {
        Answer answer = ask(request);
        if (answer.kind == Answer::Kind::line) return std::move(answer.text);
        if (answer.kind == Answer::Kind::end) return std::nullopt;
        if (answer.kind == Answer::Kind::tooLong) say(localText(L"That line is too long."));
    }
}

std::optional<EditorBlock> CommandLine::takeEditorBlock() {
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
        return Event{
            {"event",  "answer"    },
            {"line",   toUtf8(line)},
            {"status", status      }
        };
    });
    return status;
}

}  // namespace tzhost
