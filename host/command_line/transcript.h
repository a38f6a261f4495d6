#pragma once

// What stands on the text screen, and where its cursor is. A prompt or a line of the host's starts
// on a new line unless the cursor stands at the start of one; so does a message that asks for it
// with a leading line feed, and the first message after an answer. The Enter of an answer moves
// nothing.
//
//   Transcript transcript;
//   transcript.setScreen([](Shown, std::wstring_view text) { std::cout << tzhost::toUtf8(text); });
//   transcript.prompt(L"Height: ");
//   transcript.answer(L"5");
//   transcript.message(L"\n");       // ends that line, once
//
// The screen gets control characters as visible codes (visible_text.h).

#include <functional>
#include <string_view>

namespace tzhost {

// What a text on the screen is. The line feed before a prompt or a line belongs to it.
enum class Shown {
    prompt,
    answer,
    message,  // of a command, perhaps a part of a line
    line,     // a whole line of the host's own
    problem,  // the same about what went wrong
    error,    // a whole line about what went wrong, for standard error
};

class Transcript {
public:
    using Screen = std::function<void(Shown kind, std::wstring_view text)>;
    // Takes what is shown from now on; an empty one drops it.
    void setScreen(Screen screen);
    // From now on problems and errors alone are shown.
    void keepToProblems() { isQuiet_ = true; }

    void prompt(std::wstring_view text);
    void answer(std::wstring_view text);
    // A text of a module, which may be a part of a line; as a problem when it says what went wrong.
    void message(std::wstring_view text, Shown kind = Shown::message);
    // A whole line of the host's own.
    void line(std::wstring_view text);
    // A whole line of the host's own about what went wrong.
    void problem(std::wstring_view text);
    // An error as one line, whatever it holds. It moves no cursor, since it goes elsewhere.
    void error(std::wstring_view text);
    // To the start of a line.
    void freshLine() { freshLine(Shown::line); }
    // The answer showed as it was typed, and its Enter moved the cursor to the start of a line.
    void answerWasTyped();

private:
    enum class Cursor {
        lineStart,
        inLine,
        afterAnswer,
        belowAnswer,  // at the start of a line only because a typed Enter moved there
    };

    void show(Shown kind, std::wstring_view text);
    void wholeLine(Shown kind, std::wstring_view text);
    void freshLine(Shown next);

    Screen screen_;
    bool isQuiet_ = false;
    Cursor cursor_ = Cursor::lineStart;
};

}  // namespace tzhost
