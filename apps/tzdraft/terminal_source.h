#pragma once

#include <memory>

#include "host/command_line/answer_source.h"

// Answers from a person at the terminal of standard input: a line to edit behind each prompt, with
// the lines typed before (kept in the file "history" of the configuration folder), and completion
// of commands, keywords and file names by Tab.
//
// Ctrl-C cancels the question, Ctrl-D on an empty line ends the input. Between the questions the
// terminal is as it was found, but that Ctrl-C does nothing: it would end the program with the
// drawing unsaved. There is one at a time.
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
    [[nodiscard]] bool isTerminal() const override { return true; }

private:
    class Editor;
    std::unique_ptr<Editor> editor_;
};

}  // namespace tzdraft
