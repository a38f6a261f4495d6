#pragma once

// Bodies of the program's own commands. Each asks its questions, does its work and prints what went
// wrong; a cancelled question ends it with nothing changed by the question.
namespace tzdraft {

void newCommand();
void openCommand();
void saveCommand();
void plotCommand();
void pageCommand();
void quitCommand();
void listCommand();
void setvarCommand();
void styleCommand();
void layerCommand();
void ucsCommand();
void lineCommand();
void selectCommand();
void eraseCommand();
void textCommand();
void circleCommand();
void attdefCommand();
void blockCommand();
void insertCommand();
void moveCommand();
void copyCommand();
void rotateCommand();
void undoCommand();
void redoCommand();
void loadCommand();
void unloadCommand();
void helpCommand();

}  // namespace tzdraft
