#pragma once

#include "host/database/drawing.h"

// The user system of the active space.
namespace tzhost {

// That of a database's active space; null means the working one. The world's when no drawing is
// open.
[[nodiscard]] UserSystem currentUserSystem(TzDbDatabase* database = nullptr);

// Makes a system that of the active space of the working drawing, as a command of the host does: no
// stack, no event. False when no drawing is open or the axes are not unit vectors at right angles.
bool setUserSystem(UserSystem const& system);

// Keeps the view standing still while the user system changes: VIEWDIR is given in the user system
// in force, so its numbers follow. Watches TILEMODE and CVPORT too, from the first call on; further
// calls change nothing.
void watchUserSystem();
// Takes the system in force for what the view stands in: after a drawing was opened or a command
// taken back, whose VIEWDIR fits already.
void noteUserSystem();

}  // namespace tzhost
