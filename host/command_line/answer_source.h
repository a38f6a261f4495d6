#pragma once

// Where the answers to the command line's questions come from: a script, a person at a terminal, or
// strings that a module sent to the document. The command line asks its source for one answer at a
// time.
//
// A source decides what is special in a line for the kind of question at hand and gives everything
// else back as it was written. It never throws but for memory.

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

// What is asked, for sources that let a person see and edit.
struct AnswerRequest {
    QuestionKind kind = QuestionKind::command;
    std::wstring_view prompt;         // ahead of the answer; to a terminal, one line that it shows
    std::vector<std::wstring> words;  // what completion may offer, global words behind "_"
};

struct Answer {
    enum class Kind {
        line,     // `text` is the answer, empty for Enter alone
        cancel,   // the user cancelled
        tooLong,  // a line beyond kLongestAnswer, which was dropped
        fault,    // something in the script that is no answer: `text` says where and what
        end,      // nothing comes any more; `text` says where, "file:line: ", or is empty
    };
    Kind kind = Kind::end;
    std::wstring text;
};

// In characters, line end left out.
constexpr std::size_t kLongestAnswer = 32768;

// What a script leaves in the editor that opens next.
struct EditorBlock {
    std::wstring text;  // lines apart by line feeds, none behind the last
    bool accepted = true;
};

class AnswerSource {
public:
    virtual ~AnswerSource() = default;
    // The answer to a question. After `end` it goes on giving `end`.
    [[nodiscard]] virtual Answer next(AnswerRequest const& request) = 0;
    // The editor block that comes next, if one does; it then counts as taken.
    [[nodiscard]] virtual std::optional<EditorBlock> takeBlock() { return std::nullopt; }
    // Whether this is a terminal, which shows prompts and answers by itself and leaves the cursor
    // at the start of a line.
    [[nodiscard]] virtual bool isTerminal() const { return false; }
};

}  // namespace tzhost
