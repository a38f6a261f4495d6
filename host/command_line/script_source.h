#pragma once

// Answers from a script: UTF-8 text, one answer a line.
//
//   empty         Enter
//   ^C            cancel
//   ;; ...        a comment
//   <<<           what follows up to ">>>" is left in the next editor, which accepts it; up to
//   ...           ">>>cancel" the editor is left without accepting. In between a line ">>>>" stands
//   >>>           for ">>>"
//
// To a string question only ^C and comments are special. A block that is met where an answer is due
// is reported and stepped over; a block without an end, and a line that is no UTF-8, end the
// script, and an editor that opens there is left without accepting.

#include <istream>
#include <memory>
#include <string>

#include "host/command_line/answer_source.h"

namespace tzhost {

class ScriptSource : public AnswerSource {
public:
    // `name` stands in the messages. Reads on as answers are asked for.
    ScriptSource(std::string name, std::unique_ptr<std::istream> text);
    // A script that is not kept in a file.
    explicit ScriptSource(std::string_view text, std::string name = "script");
    // Opens a file, or standard input for "-". A file is read and checked whole: null and one line
    // in `error` when that fails.
    [[nodiscard]] static std::unique_ptr<ScriptSource> open(std::string const& file,
                                                            std::string& error);

    [[nodiscard]] Answer next(AnswerRequest const& request) override;
    [[nodiscard]] std::optional<EditorBlock> takeBlock() override;
    [[nodiscard]] bool hasEnded() const override { return hasEnded_; }
    [[nodiscard]] std::wstring place() const override { return placeOf(taken_); }

private:
    enum class Length { bounded, any };
    struct Line {
        std::wstring text;
        int number = 0;
        bool isTooLong = false;
    };

    // Nothing at the end and at a fault.
    [[nodiscard]] std::optional<Line> read(Length length);
    // The next line that is no comment; it stays the next one.
    [[nodiscard]] Line const* peek();
    [[nodiscard]] std::optional<EditorBlock> readBlock();
    void fail(int line, wchar_t const* what);
    [[nodiscard]] std::wstring placeOf(int line) const;
    [[nodiscard]] Answer last();

    std::string name_;
    std::unique_ptr<std::istream> text_;
    std::optional<Line> peeked_;
    std::wstring fault_;     // what ended the script early, until it is reported
    bool isBroken_ = false;  // that was reported
    bool hasEnded_ = false;
    int lines_ = 0;
    int taken_ = 0;  // the line of the last answer
};

}  // namespace tzhost
