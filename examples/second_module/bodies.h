#pragma once

struct resbuf;

// What the module's commands and its function do. Each runs to its end on the host's one thread and
// prints what it has to say. [command]
namespace marks {

// MARK: places a numbered mark that points at something.
void markCommand();
// MARKLIST: lists texts with their place in user coordinates and on the screen, and their fonts.
void listCommand();
// MARKNOTE: writes notes with the commands and editors of the text module.
void noteCommand();
// MARKSETUP: tells how the program is set up for texts.
void setupCommand();
// (MARKTEXT #2A): prints the plain contents of a text; false for anything but one entity.
[[nodiscard]] bool textFunction(resbuf const* arguments);

}  // namespace marks
