#pragma once

#include <string>

#include "host/editors/edited_text.h"

// One session of an editor on one text: the next block of the script, else a program, else nothing.
namespace tzhost {

enum class SessionEnd { left, accepted };

struct EditorProgram {
    std::string command;  // empty for none
    wchar_t const* lack;  // the line that says how to name one, in the user's language
};

// Edits the text with the next block of the script, else with the program. When the session is left
// although nobody cancelled it, one message has said why. What was edited and not taken then lies
// in a file whose name was printed. A session without a change touches nothing: it counts as
// accepted, but for an empty text, of which it makes nothing.
[[nodiscard]] SessionEnd runEditorSession(EditedText& text, EditorProgram const& program);

}  // namespace tzhost
