#pragma once

// Undo of commands.
namespace tzhost {

// Makes each command that runs a step of the working drawing's undo log. Call once when the host
// starts; a command that replaces the drawing leaves no step.
void keepCommandsForUndo();

// Takes the last command on the working drawing back; false when there is none.
bool takeBackCommand();

}  // namespace tzhost
