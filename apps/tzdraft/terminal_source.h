#pragma once

#include <memory>

#include "host/command_line/answer_source.h"

// Answers from a person at the terminal of standard input: a line to edit after each prompt, with
// the lines typed before (kept in the file "history" of the configuration folder). Tab completes
// what the question offers; where it asks for a text, a tab is a part of the answer.
//
// Ctrl-C cancels the question. Ctrl-D on an empty line ends the input of the command and of the
// idle prompt after it; whoever reads commands may go on. Between the questions the terminal is as
// it was found, except that Ctrl-C does nothing: it would end the program with the drawing unsaved.
// There is one at a time.
namespace tzdraft {

class TerminalSource : public tzhost::AnswerSource {
public:
    TerminalSource();
    TerminalSource(TerminalSource const&) = delete;
    TerminalSource& operator=(TerminalSource const&) = delete;
    ~TerminalSource() override;

    // Whether standard input is a terminal.
    [[nodiscard]] static bool isThere();

    [[nodiscard]] tzhost::Answer next(tzhost::AnswerRequest const& request) override;
    [[nodiscard]] bool hasEnded() const override;
    [[nodiscard]] bool isPerson() const override { return true; }
    [[nodiscard]] bool echoes() const override { return true; }
    [[nodiscard]] bool ownsTerminal() const override { return true; }

private:
    class Editor;
    std::unique_ptr<Editor> editor_;
};

}  // namespace tzdraft
