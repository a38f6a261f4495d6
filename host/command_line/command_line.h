#pragma once

// The command line: shows prompts and messages, takes answers, and keeps what one question leaves
// for the next. There is one; whoever drives the host gives it a source of answers and a screen.
//
//   tzhost::CommandLine& line = tzhost::commandLine();
//   line.setSource(script.get());
//   line.setScreen(writeByKind);
//   line.attach();
//   while (auto command = line.readCommand()) run(*command);
//
// Not thread-safe. Throws for want of memory alone.

#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "host/command_line/answer_source.h"
#include "host/command_line/keyword_list.h"
#include "host/command_line/sent_strings.h"
#include "host/command_line/transcript.h"
#include "host/platform/output.h"

namespace tzhost {

// What tzedInitGet arms: it holds for one question.
struct Armed {
    int flags = 0;
    KeywordList words;
    std::wstring list;  // the words as they were handed over

    // Bits of the flags.
    static constexpr int kNoEmptyAnswer = 1;
    static constexpr int kNoZero = 2;
    static constexpr int kNoNegative = 4;
    static constexpr int kFreeText = 0x80;
    [[nodiscard]] bool has(int bit) const { return (flags & bit) != 0; }
};

class CommandLine : public PrintSink, public NotificationSink {
public:
    // Not owned; the source before. Null stands for a script at its end.
    AnswerSource* setSource(AnswerSource* source);
    // Where all that is shown goes, errors included.
    void setScreen(Transcript::Screen screen) { transcript_.setScreen(std::move(screen)); }
    // Asked before and after each answer: true ends the input at once, which counts as a failure.
    // The source is not asked any more.
    void setEndCheck(std::function<bool()> mustEnd) { mustEnd_ = std::move(mustEnd); }
    // A script ends at the first thing that goes wrong, which counts as a failure.
    void endScriptAtProblems() { endsAtProblems_ = true; }
    // The screen shows nothing else than problems and errors.
    void keepToProblems() { transcript_.keepToProblems(); }
    // Takes what the host and its modules print, until the object ends or another takes over.
    void attach();
    ~CommandLine() override;

    // At the idle prompt: the next line, empty for Enter alone; nothing when the input has ended.
    // `words` are for completion.
    [[nodiscard]] std::optional<std::wstring> readCommand(std::vector<std::wstring> words = {});
    // Whether nothing comes any more. At a terminal the input of one command may end before.
    [[nodiscard]] bool hasEnded() const;
    // Takes an end of the input back, when a person stays after all.
    void goOn() { hasEndedInCommand_ = false; }
    // What a script leaves in the editor that opens now.
    [[nodiscard]] std::optional<EditorBlock> takeEditorBlock();
    // Whether a person answers, not a script.
    [[nodiscard]] bool isPerson() const { return source_ != nullptr && source_->isPerson(); }
    // The input ended while a question waited, the script held a fault or asked for something that
    // failed, or the input had to end: exit status 1.
    [[nodiscard]] bool hasFailed() const { return hasFailed_ || hasEndedInCommand_; }

    // A line of the host's own; no event.
    void say(std::wstring_view line) { transcript_.line(line); }
    // Ends the line that the cursor stands in.
    void freshLine() { transcript_.freshLine(); }
    // A line about an answer, a command or a call that went wrong. A script that ends at problems
    // ends here, and the line is an error with its place, too.
    void sayProblem(std::wstring_view what);
    // A command could not do what it was told: a line of the host's own. In a script also an error
    // with its place, and a failure of the session.
    void sayFailure(std::wstring const& what);
    // Who prints: what modules print are events, too, what the host's own commands print are not.
    // A module's function that works prints nothing, so what it prints is what went wrong.
    enum class Voice { module, function, host };
    void setVoice(Voice voice) { voice_ = voice; }
    void print(std::wstring_view text) override;
    // A message that waits for the user is a line of the host's own, and nobody waits.
    void notify(Notification const& notification) override;
    // Puts everything back as at the start, the source and the screens included.
    void reset();

    // For questions. Each showing of `request` gives one answer; faults of the script are reported
    // and stepped over.
    [[nodiscard]] Answer ask(AnswerRequest request);
    void arm(Armed armed) { armed_ = std::move(armed); }
    // Hands the armed flags and words to the question that begins, and forgets what the one before
    // left.
    [[nodiscard]] Armed takeArmed();
    // What completion may offer at the next question for a text, taken once.
    void offer(Offer offer) { offer_ = std::move(offer); }
    [[nodiscard]] Offer takeOffer() { return std::exchange(offer_, {}); }
    // The keyword or free text of status -5005, taken once.
    void leaveInput(std::wstring text) { input_ = std::move(text); }
    [[nodiscard]] std::optional<std::wstring> takeInput();
    // A question that failed without taking a line answers with this: the 100th in a row is a
    // cancel.
    [[nodiscard]] int failed(int status);
    // Ends a question that took an answer: the event, and the status again.
    int answered(std::wstring_view line, int status) const;

private:
    [[nodiscard]] Answer read(AnswerRequest const& request);
    [[nodiscard]] Answer readFromSource(AnswerRequest const& request);
    void showPrompt(AnswerRequest& request, std::wstring const& prompt);
    void showAnswer(Answer const& answer);
    [[nodiscard]] bool mustEnd();
    void complain(std::wstring const& text);
    void countProblem(std::wstring_view what);
    [[nodiscard]] std::wstring place() const;
    void endedInCommand(std::wstring const& where);

    AnswerSource* source_ = nullptr;
    Transcript transcript_;
    std::function<bool()> mustEnd_;
    SentStrings sent_;
    Armed armed_;
    Offer offer_;
    std::optional<std::wstring> input_;
    Voice voice_ = Voice::module;
    int failures_ = 0;  // questions in a row that took no line
    bool hasFailed_ = false;
    bool hasEndedInCommand_ = false;
    bool endsAtProblems_ = false;
    bool isStopped_ = false;  // the script ended at a problem
    bool isAttached_ = false;
};

[[nodiscard]] CommandLine& commandLine();

}  // namespace tzhost
