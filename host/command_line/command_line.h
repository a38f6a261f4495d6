#pragma once

// The command line: shows prompts and messages, takes answers, and keeps what one question leaves
// for the next. There is one; whoever drives the host gives it a source of answers and a screen.
//
//   tzhost::CommandLine& line = tzhost::commandLine();
//   line.setSource(script.get());
//   line.setScreen(writeToStandardOutput);
//   line.attach();
//   while (auto command = line.readCommand()) run(*command);
//
// Not thread-safe. Never throws but for memory.

#include <functional>
#include <optional>
#include <string>
#include <string_view>
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
    // Where the transcript goes, and where one-line errors of the script go.
    void setScreen(Transcript::Screen screen) { transcript_.setScreen(std::move(screen)); }
    void setErrorScreen(Transcript::Screen screen) { errors_ = std::move(screen); }
    // Takes what the host and its modules print, until the object ends or another takes over.
    void attach();
    ~CommandLine() override;

    // At the idle prompt: the next line, empty for Enter alone; nothing when the input has ended.
    // `words` are for completion.
    [[nodiscard]] std::optional<std::wstring> readCommand(std::vector<std::wstring> words = {});
    // What a script leaves in the editor that opens now.
    [[nodiscard]] std::optional<EditorBlock> takeEditorBlock();
    // Whether answers come from a script, or from nowhere.
    [[nodiscard]] bool isScripted() const { return source_ == nullptr || !source_->isTerminal(); }
    // The input ended while a question waited, or the script held a fault: exit status 1.
    [[nodiscard]] bool hasFailed() const { return hasFailed_; }

    // A line of the host's own; no event.
    void say(std::wstring_view line) { transcript_.line(line); }
    // Ends the line that the cursor stands in.
    void freshLine() { transcript_.freshLine(); }
    // Who prints: what modules print are events, too, what the host's own commands print are not.
    enum class Voice { module, host };
    void setVoice(Voice voice) { voice_ = voice; }
    void print(std::wstring_view text) override;
    // A message that waits for the user is a line of the host's own, and nobody waits.
    void notify(Notification const& notification) override;
    // Puts everything back as at the start, the source and the screens included.
    void reset();

    // For questions. Each showing of `request` gives one answer; faults of the script are reported
    // and stepped over.
    [[nodiscard]] Answer ask(AnswerRequest const& request);
    void arm(Armed armed) { armed_ = std::move(armed); }
    // Hands the armed flags and words to the question that begins, and forgets what the one before
    // left.
    [[nodiscard]] Armed takeArmed();
    // The keyword or free text behind -5005, taken once.
    void leaveInput(std::wstring text) { input_ = std::move(text); }
    [[nodiscard]] std::optional<std::wstring> takeInput();
    // A question that failed without taking a line answers with this: the 100th in a row is a
    // cancel.
    [[nodiscard]] int failed(int status);
    // Ends a question that took an answer: the event, and the status again.
    int answered(std::wstring_view line, int status) const;

private:
    [[nodiscard]] Answer readFromSource(AnswerRequest const& request);
    void complain(std::wstring const& text);
    void endedInCommand(std::wstring const& where);

    AnswerSource* source_ = nullptr;
    Transcript transcript_;
    Transcript::Screen errors_;
    SentStrings sent_;
    Armed armed_;
    std::optional<std::wstring> input_;
    Voice voice_ = Voice::module;
    int failures_ = 0;  // questions in a row that took no line
    bool hasFailed_ = false;
    bool isAttached_ = false;
};

[[nodiscard]] CommandLine& commandLine();

}  // namespace tzhost
