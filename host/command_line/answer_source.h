#pragma once

// Where the answers to the command line's questions come from: a script, a person at a terminal, or
// strings that a module sent to the document. The command line asks its source for one answer at a
// time.
//
// A source decides what is special in a line for the kind of question at hand and gives everything
// else back as it was written. It throws for want of memory alone.

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace tzhost {

enum class QuestionKind {
    command,
    keyword,
    string,
    symbol,
    point,
    real,
    integer,
    angle,
    orientation,
    distance,
    selection,
    entity,
    drag,
};

// The name of a kind, as events give it.
[[nodiscard]] char const* nameOf(QuestionKind kind);

// What completion may offer for an answer.
struct Offer {
    enum class Kind {
        nothing,  // a text, in which a tab is a tab
        words,    // the word before the cursor, by `choices`; global words begin with "_"
        names,    // the whole answer, by `choices`
        files,    // the whole answer, as the name of a file; one without a slash lies in `home`
    };
    Kind kind = Kind::nothing;
    std::vector<std::wstring> choices = {};
    std::wstring home = {};  // a folder; empty: the working folder
};

// What is asked, for sources that let a person see and edit.
struct AnswerRequest {
    QuestionKind kind = QuestionKind::command;
    // To a source that owns the terminal: one line, which the source shows before the answer.
    std::wstring_view prompt;
    Offer offer = {};
};

struct Answer {
    enum class Kind {
        line,     // `text` is the answer, empty for Enter alone
        cancel,   // the user cancelled
        tooLong,  // a line beyond kLongestAnswer, which was dropped
        fault,    // something in the script that is no answer: `text` says where and what
        end,      // no answer: the input ends; `text` says where, "file:line: ", or is empty
    };
    Kind kind = Kind::end;
    std::wstring text;
};

// In characters, line end left out.
constexpr std::size_t kLongestAnswer = 32768;

// What a script leaves in the editor that opens next.
struct EditorBlock {
    std::wstring text;  // lines with line feeds between them, none after the last
    bool accepted = true;
};

class AnswerSource {
public:
    virtual ~AnswerSource() = default;
    // The answer to a question. Once hasEnded, each is `end`.
    [[nodiscard]] virtual Answer next(AnswerRequest const& request) = 0;
    // The editor block that comes next, if one does; it then counts as taken.
    [[nodiscard]] virtual std::optional<EditorBlock> takeBlock() { return std::nullopt; }
    // Whether nothing comes any more. A person can end the input of one command and go on.
    [[nodiscard]] virtual bool hasEnded() const { return true; }
    // Where the last answer stood, "file:line: "; empty when that has no place.
    [[nodiscard]] virtual std::wstring place() const { return {}; }

    // Whether a person answers, who can be asked whether something is meant. What a script says is
    // meant.
    [[nodiscard]] virtual bool isPerson() const { return false; }
    // Whether an answer shows on the screen as it is typed, with an Enter after it; the transcript
    // then leaves it out.
    [[nodiscard]] virtual bool echoes() const { return false; }
    // Whether the source shows the last line of a prompt itself, since it edits what follows it.
    [[nodiscard]] virtual bool ownsTerminal() const { return false; }
};

}  // namespace tzhost
