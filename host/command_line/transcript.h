#pragma once

// What stands on the text screen, and where its cursor is. A prompt or a line of the host's starts
// on a new line unless the cursor stands at the start of one; so does a message that asks for it
// with a line feed in front, and the first message behind an answer. The Enter of an answer moves
// nothing.
//
//   Transcript screen([](std::wstring_view text) { std::cout << tzhost::toUtf8(text); });
//   screen.prompt(L"Height: ");
//   screen.answer(L"5");
//   screen.message(L"\n");       // ends that line, once

#include <functional>
#include <string_view>

namespace tzhost {

class Transcript {
public:
    using Screen = std::function<void(std::wstring_view)>;
    // Takes what is shown from now on; an empty one drops it.
    void setScreen(Screen screen);

    void prompt(std::wstring_view text);
    void answer(std::wstring_view text);
    // A text of a module, which may be a part of a line.
    void message(std::wstring_view text);
    // A whole line of the host's own.
    void line(std::wstring_view text);
    // To the start of a line.
    void freshLine();
    // A terminal has shown a prompt and its answer, and stands at the start of a line.
    void answeredOnTerminal();

private:
    enum class Cursor {
        lineStart,
        inLine,
        behindAnswer,
        belowAnswer,  // at the start of a line only because a terminal's Enter moved there
    };

    void show(std::wstring_view text);

    Screen screen_;
    Cursor cursor_ = Cursor::lineStart;
};

}  // namespace tzhost
