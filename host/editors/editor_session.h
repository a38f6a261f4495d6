#pragma once

#include <string>

#include "host/editors/edited_text.h"

// One session of an editor on one text: the next block of the script, else a program, else nothing.
namespace tzhost {

enum class SessionEnd { left, accepted };

// Edits the text with the next block of the script, else with the program; an empty command is no
// program. When the session is left although nobody cancelled it, one message has said why. What
// was edited and not taken then lies in a file whose name was printed. A session without a change
// touches nothing: it counts as accepted, but for an empty text, of which it makes nothing.
[[nodiscard]] SessionEnd runEditorSession(EditedText& text, std::string const& program);

}  // namespace tzhost
