#pragma once

// One question, from its prompt to its status: what all kinds of questions have in common.
//
//   int tzedGetReal(wchar_t const* prompt, double* result) {
//       if (auto const failed = tzhost::failsAt("tzedGetReal")) return *failed;
//       Question question(QuestionKind::real, prompt);
//       return question.ask([&](std::wstring_view answer) { ... return Reply::done(5100); });
//   }
//
// A question takes the armed flags and words when it is made, and reports itself as an event. What
// means the same to every kind (cancel, Enter, keywords, free text, the end of the input) never
// reaches the reader. A reader may ask questions of its own.

#include <functional>
#include <optional>
#include <string>
#include <string_view>

#include "host/command_line/command_line.h"
#include "tz/rx/status.h"

namespace tzhost {

// What becomes of an answer.
struct Reply {
    enum class Kind {
        done,        // the question ends with `status`
        goOn,        // a part of the answer: asked again
        refused,     // `complaint` is shown and the question asked again
        unreadable,  // no value of the kind: free text where that is let through, else refused
    };
    Kind kind = Kind::unreadable;
    int status = Tzad::ePromptError;
    std::wstring complaint;

    [[nodiscard]] static Reply done(int status) { return {Kind::done, status, {}}; }
    [[nodiscard]] static Reply goOn(int status) { return {Kind::goOn, status, {}}; }
    [[nodiscard]] static Reply refused(std::wstring why) {
        return {Kind::refused, Tzad::ePromptError, std::move(why)};
    }
    [[nodiscard]] static Reply unreadable(std::wstring why) {
        return {Kind::unreadable, Tzad::ePromptError, std::move(why)};
    }
};

// When the fault plan lets the operation fail: the status that it answers with, which after too
// many failures in a row is a cancel. The armed flags are spent then, too.
[[nodiscard]] std::optional<int> failsAt(std::string_view operation);

class Question {
public:
    using Reader = std::function<Reply(std::wstring_view answer)>;
    using WordReader = std::function<Reply(int index)>;

    // With what tzedInitGet armed. `prompt` may be null.
    Question(QuestionKind kind, wchar_t const* prompt);
    // With flags and words of its own.
    Question(QuestionKind kind, wchar_t const* prompt, Armed armed);
    Question(Question const&) = delete;
    Question& operator=(Question const&) = delete;

    // What Enter alone and a cancel give: 5000 and -5002 without this.
    void setEndings(int empty, int cancel);
    // What a keyword does; without this it waits for tzedGetInput and the question gives -5005.
    void setWordReader(WordReader reader) { wordReader_ = std::move(reader); }
    // The flags do not apply; the words do.
    void clearFlags() { armed_.flags = 0; }
    // What completion may offer, in place of the keywords.
    void setOffer(Offer offer) { offer_ = std::move(offer); }
    // Shown from now on instead of the prompt.
    void setPrompt(std::wstring prompt) { prompt_ = std::move(prompt); }
    [[nodiscard]] Armed const& armed() const { return armed_; }

    // The reader gets answers without blanks around them; that of a string question gets
    // the line as it is.
    [[nodiscard]] int ask(Reader const& read);

private:
    [[nodiscard]] Reply replyTo(std::wstring_view answer, Reader const& read);
    [[nodiscard]] std::optional<int> take(std::wstring const& line, Reader const& read);

    CommandLine& line_;
    QuestionKind kind_;
    std::wstring prompt_;
    Armed armed_;
    Offer offer_;
    WordReader wordReader_;
    int emptyStatus_ = Tzad::ePromptNone;
    int cancelStatus_ = Tzad::ePromptCancel;
};

// Refuses a number that the armed flags do not let through; nothing when they do.
[[nodiscard]] std::optional<Reply> refusalOf(double value, Armed const& armed);

}  // namespace tzhost
